#pragma once

#include <functional>
#include <memory>
#include <string>

#include "platform/interface_file.h"
#include "platform/outlets.h"

namespace onramp {

/// The interface through which the application reports events to its controller and asks the
/// controller for decisions. An application has one controller, which is also the owner of the main
/// interface file.
class ApplicationDelegate : public InterfaceOwner {
 public:
  /// Gives the controller the objects of the main interface file.
  virtual void setOutlets(const Interface& mainInterface) = 0;

  /// Called once, after setOutlets() and before the main loop starts.
  virtual void awakeFromNib() = 0;

  /// The two functions below are called, in this order, when the main loop starts. The second one
  /// is not called if the first one has asked the application to terminate.
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
/// status. If the interface file cannot be loaded, prints a message that names the file; the exit
/// status is then 1. On some systems the process ends inside this function when the application
/// terminates. With Qt, the process ends inside this function after an invalid option, after --help
/// and --version, and when there is no display.
int runApplication(int argc, char** argv, const std::string& mainInterfaceName,
                   const std::function<std::unique_ptr<ApplicationDelegate>()>& makeDelegate);

/// Terminates the application. The main loop and any modal loop inside it stop, and no further
/// timer, posted action or event is handled. On some systems the process ends inside this function.
/// On other systems the function returns, and the caller must stop what it is doing.
void terminateApplication();

/// hideApplication() takes all windows off the screen. unhideApplication() brings those windows
/// back. Do not call hideApplication() twice without unhideApplication() in between.
void hideApplication();
void unhideApplication();

/// Asks the system to make this the active application, even if the user is working in another
/// application. The system may refuse.
void activateIgnoringOtherApps();

/// Returns the main menu, or an empty handle when there is none.
[[nodiscard]] Menu mainMenu();
/// Makes `menu` the main menu. Does nothing in a front end whose windows show their own menu bars.
void setMainMenu(const Menu& menu);

}  // namespace onramp
