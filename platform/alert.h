#pragma once

#include <functional>
#include <string>

#include "platform/outlets.h"

namespace onramp {

/// The answers that a sheet gives for its buttons.
inline constexpr int kAlertDefaultReturn = 1;
inline constexpr int kAlertOtherReturn = -1;

/// Shows an alert of the critical style with one button and returns when the user has dismissed it.
void runCriticalAlert(const std::string& messageText, const std::string& informativeText,
                      const std::string& buttonTitle);

struct AlertSheet {
  std::string title;
  std::string message;
  std::string defaultButton;
  std::string otherButton;
};

/// Shows a sheet on `window` and returns at once. `didEnd` gets the answer when the user dismisses
/// it.
void beginAlertSheet(const AlertSheet& sheet, const Window& window,
                     std::function<void(int returnCode)> didEnd);

}  // namespace onramp
