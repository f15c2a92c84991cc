#pragma once

#include <functional>
#include <memory>
#include <string>

#include "platform/interface_file.h"
#include "platform/outlets.h"

namespace onramp {

/// The interface through which the application informs and asks its controller. An application has
/// one controller, for which the main interface file is loaded.
class ApplicationDelegate : public InterfaceOwner {
 public:
  /// Gives the controller the objects of the main interface file. The application calls
  /// awakeFromNib() next.
  virtual void setOutlets(const Interface& mainInterface) = 0;
  virtual void awakeFromNib() = 0;

  /// The two functions below are called, in this order, when the main loop starts. The second one
  /// is not called if the first one has asked the application to terminate.
  virtual void applicationWillFinishLaunching() = 0;
  virtual void applicationDidFinishLaunching() = 0;

  /// Called after the user has closed the last window. Returns whether the application should then
  /// terminate.
  [[nodiscard]] virtual bool applicationShouldTerminateAfterLastWindowClosed() = 0;

  /// Called when the user tries to close `window` or to quit. Returns whether that is allowed.
  [[nodiscard]] virtual bool windowShouldClose(const Window& window) = 0;
};

/// Creates the controller with `makeDelegate`, loads the main interface file for the controller,
/// and runs the main loop until the application terminates. Returns the process's exit status.
int runApplication(int argc, char** argv, const std::string& mainInterfaceName,
                   const std::function<std::unique_ptr<ApplicationDelegate>()>& makeDelegate);

/// Asks the application to terminate. The main loop and any modal loop inside it stop, and no
/// further timer or event is handled. This function may not return. If it does return, the caller
/// must stop what it is doing.
void terminateApplication();

/// hideApplication() takes all windows off the screen. unhideApplication() brings those windows
/// back.
void hideApplication();
void unhideApplication();

/// Makes this the active application, even if the user is working in another one.
void activateIgnoringOtherApps();

[[nodiscard]] Menu mainMenu();
void setMainMenu(const Menu& menu);

}  // namespace onramp
