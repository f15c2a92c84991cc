#pragma once

#include <string>

#include "platform/outlets.h"

namespace onramp::conformance {

/// Returns the application's window, or an empty handle on the recording front end.
[[nodiscard]] const Window& window();

/// Clicks the button titled `title` in an alert or a sheet, as a user would, once that button is
/// visible. Returns at once. Each front end defines this function for itself; on the recording
/// front end, it does nothing.
void clickSoon(const std::string& title);

}  // namespace onramp::conformance
