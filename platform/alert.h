#pragma once

#include <functional>
#include <string>

#include "platform/outlets.h"

namespace onramp {

/// The codes that a sheet returns for its default button and its other button.
inline constexpr int kAlertDefaultReturn = 1;
inline constexpr int kAlertOtherReturn = -1;

/// Shows a critical alert with one button. Returns when the user has dismissed the alert.
void runCriticalAlert(const std::string& messageText, const std::string& informativeText,
                      const std::string& buttonTitle);

struct AlertSheet {
  std::string title;
  std::string message;
  std::string defaultButton;
  std::string otherButton;
};

/// Shows a sheet on `window` and returns at once. When the sheet has ended, calls `didEnd` with
/// kAlertOtherReturn if the user clicked the other button, and with kAlertDefaultReturn in all
/// other cases.
void beginAlertSheet(const AlertSheet& sheet, const Window& window,
                     std::function<void(int returnCode)> didEnd);

}  // namespace onramp
