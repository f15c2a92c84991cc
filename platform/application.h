#pragma once

#include <functional>
#include <memory>
#include <string>

#include "platform/interface_file.h"
#include "platform/outlets.h"

namespace onramp {

/// What the application asks of, and tells, the one controller behind its main interface file.
class ApplicationDelegate : public InterfaceOwner {
 public:
  /// Gives the controller its outlets; then awakeFromNib() follows.
  virtual void setOutlets(const Interface& mainInterface) = 0;
  virtual void awakeFromNib() = 0;

  /// Called one after the other when the main loop starts. When the first one asks to terminate,
  /// the second is not called.
  virtual void applicationWillFinishLaunching() = 0;
  virtual void applicationDidFinishLaunching() = 0;

  /// Asked after the user closed the last window.
  [[nodiscard]] virtual bool applicationShouldTerminateAfterLastWindowClosed() = 0;

  /// Asked before the user closes `window`.
  [[nodiscard]] virtual bool windowShouldClose(const Window& window) = 0;
};

/// Makes the controller, loads the main interface file for it and runs the main loop until the
/// application terminates. Returns the process's exit status.
int runApplication(int argc, char** argv, const std::string& mainInterfaceName,
                   const std::function<std::unique_ptr<ApplicationDelegate>()>& makeDelegate);

/// Asks the application to end. The main loop, and a modal one inside it, stop; no timer or event
/// is handled any more. May not return; where it does, the caller ends what it is doing.
void terminateApplication();

/// Takes all windows off the screen, and brings those back that hideApplication() took.
void hideApplication();
void unhideApplication();

/// Makes this the active application, whatever else is in use.
void activateIgnoringOtherApps();

[[nodiscard]] Menu mainMenu();
void setMainMenu(const Menu& menu);

}  // namespace onramp
