#pragma once

#include <functional>
#include <list>
#include <map>
#include <memory>
#include <set>
#include <string>
#include <utility>
#include <vector>

#include "platform/alert.h"
#include "platform/application.h"
#include "platform/outlets.h"

namespace onramp::recording {

/// One object of the user interface, with the values that the program has set.
struct Object {
  OutletKind kind = OutletKind::kView;
  std::string name;
  bool hidden = false;
  bool enabled = true;
  bool animating = false;
  bool resizeIndicator = true;
  /// The text of a text field, or the title of a window, button or menu item.
  std::string text;
  std::map<std::pair<int, int>, std::string> cells;  ///< titles by row and column
  int selectedRow = -1;
  int selectedColumn = -1;
  std::string imagePath;
  ImageScaling scaling = ImageScaling::kProportionallyDown;
  ArrayController* content = nullptr;
  std::map<std::string, std::string> headers;  ///< the titles of a table's columns, by identifier
  std::set<std::string> fixedColumns;          ///< the columns that the user cannot edit
  bool columnsCanMove = true;
  bool columnsCanBeSelected = true;
  std::vector<std::pair<std::string, std::function<void()>>> items;  ///< a pop-up button's items
  Object* superview = nullptr;
  std::vector<Object*> subviews;
  std::string action;
  InterfaceOwner* owner = nullptr;  ///< the owner of the object's interface file

  [[nodiscard]] NativeObject* native() { return reinterpret_cast<NativeObject*>(this); }
};

struct ShownAlert {
  std::string messageText;
  std::string informativeText;
  std::string buttonTitle;
};

/// Replaces the screen, the desktop, the user and the clock. Records what the program shows and
/// opens. Opening a file or an address always succeeds, and alerts return at once. Time passes only
/// in runTimers(). sleepOffMainThread() does not sleep; it records the pause and calls
/// `duringPause`.
class FrontEnd {
 public:
  static FrontEnd& instance();

  /// Restores the state of a new process, but keeps the objects of pages that still exist.
  void reset();

  /// Launches the application for `delegate` as a real front end does, up to the point where it
  /// waits for the user. The delegate must exist until the next reset().
  void launch(ApplicationDelegate& delegate);

  /// Returns the most recently loaded object with that name. Aborts the process when there is none.
  [[nodiscard]] Object& object(const std::string& name);

  /// Clicks a button as the user would. Does nothing when the button is hidden or disabled.
  void click(const std::string& buttonName);

  /// Runs the scheduled timers, the earliest first, until none is left or the application has
  /// terminated.
  void runTimers();

  // Used by this front end's implementation of platform/.
  void schedule(double seconds, std::function<void()> action);
  void open(const std::string& target);
  std::vector<Object*> loaded;  ///< the objects of all loaded interface files, in loading order
  [[nodiscard]] Object* menuBar();

  // What the program did.
  std::vector<std::string> log;  ///< "terminate", "hide", "front", … in order
  std::vector<ShownAlert> alerts;
  std::vector<std::pair<AlertSheet, std::function<void(int)>>> sheets;  ///< with their handlers
  std::vector<unsigned> pauses;     ///< the length of every sleepOffMainThread(), in seconds
  std::vector<double> delays;       ///< the delay of every timer, in seconds
  std::vector<std::string> opened;  ///< every path and address that the program opened
  bool terminated = false;

  // What a test sets up.
  std::set<std::string> missingInterfaces;  ///< the interface files that cannot be loaded
  /// Called on the main thread during each pause. `pause` counts the pauses from 1.
  std::function<void(int pause)> duringPause;
  /// Called when the program opens a file or an address.
  std::function<void()> duringOpening;

 private:
  Object& addMenuObject(OutletKind kind, const std::string& text);

  struct Timer {
    double due;
    std::function<void()> action;
  };

  double now_ = 0;
  std::list<Timer> timers_;
  std::list<Object> menus_;  // the menu bar first
  std::unique_ptr<Interface> mainInterface_;
};

}  // namespace onramp::recording
