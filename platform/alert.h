#pragma once

#include <functional>
#include <string>

#include "platform/outlets.h"

namespace onramp {

/// The codes that beginAlertSheet() passes to `didEnd`.
inline constexpr int kAlertDefaultReturn = 1;
inline constexpr int kAlertOtherReturn = -1;

/// Shows a critical alert with one button. Blocks until the user dismisses the alert or the
/// application terminates.
void runCriticalAlert(const std::string& messageText, const std::string& informativeText,
                      const std::string& buttonTitle);

/// The title, message and button titles of a sheet (an alert attached to a window) with two
/// buttons.
struct AlertSheet {
  std::string title;
  std::string message;
  std::string defaultButton;
  std::string otherButton;
};

/// Shows `sheet` on `window` and returns at once. `window` must not be an empty handle. When the
/// sheet has closed, calls `didEnd` with kAlertOtherReturn if the user clicked `otherButton`, and
/// with kAlertDefaultReturn otherwise. Does not call `didEnd` if the application terminates first.
void beginAlertSheet(const AlertSheet& sheet, const Window& window,
                     std::function<void(int returnCode)> didEnd);

}  // namespace onramp
