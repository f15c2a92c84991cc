#pragma once

#include <functional>
#include <memory>
#include <string>

#include "platform/interface_file.h"
#include "platform/outlets.h"

namespace onramp {

/// The interface of the application's only controller. The application reports events to the
/// controller and asks it for decisions. The controller is also the owner of the main interface
/// file.
class ApplicationDelegate : public InterfaceOwner {
 public:
  /// Passes the controller the objects of the main interface file.
  virtual void setOutlets(const Interface& mainInterface) = 0;

  /// Called once, after setOutlets() and before the main loop starts.
  virtual void awakeFromNib() = 0;

  /// The two functions below are called when the main loop starts, applicationWillFinishLaunching()
  /// first. If that call terminates the application, applicationDidFinishLaunching() is not called.
  virtual void applicationWillFinishLaunching() = 0;
  virtual void applicationDidFinishLaunching() = 0;

  /// Called after the user has closed the last window. Returns whether the application should
  /// terminate.
  [[nodiscard]] virtual bool applicationShouldTerminateAfterLastWindowClosed() = 0;

  /// Called when the user tries to close `window` or to quit the application. Returns whether the
  /// user may do so.
  [[nodiscard]] virtual bool windowShouldClose(const Window& window) = 0;
};

/// Creates the controller with `makeDelegate`, loads the interface file `mainInterfaceName` for the
/// controller, and runs the main loop until the application terminates. Returns the process's exit
/// status. If the interface file cannot be loaded, prints a message that names the file; the result
/// is then 1. On some systems, the process exits inside this function when the application
/// terminates. With Qt, the process also exits inside this function when there is no display, and
/// after an invalid option, --help or --version.
int runApplication(int argc, char** argv, const std::string& mainInterfaceName,
                   const std::function<std::unique_ptr<ApplicationDelegate>()>& makeDelegate);

/// Terminates the application. The main loop and any modal loop stop, and no more timers, events or
/// actions passed to performOnMainThread() are handled. On some systems, the process exits inside
/// this function. On other systems, the function returns, and the caller must then return without
/// doing anything else.
void terminateApplication();

/// hideApplication() hides all windows, and unhideApplication() shows them again. Do not call
/// hideApplication() twice without calling unhideApplication() in between.
void hideApplication();
void unhideApplication();

/// Asks the system to make this the active application, even if the user is working in another
/// application. The system may refuse.
void activateIgnoringOtherApps();

/// Returns the main menu, or an empty handle when there is none.
[[nodiscard]] Menu mainMenu();
/// Makes `menu` the main menu. Does nothing in a front end where each window has its own menu bar.
void setMainMenu(const Menu& menu);

}  // namespace onramp
