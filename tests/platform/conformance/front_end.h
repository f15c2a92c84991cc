#pragma once

#include <string>

#include "platform/outlets.h"

namespace onramp::conformance {

/// Returns the application's window, or an empty handle on the recording front end.
[[nodiscard]] const Window& window();

/// Returns at once. Later, when the button `title` of an alert or a sheet is visible, clicks it as
/// a user would. Each front end has its own definition. On the recording front end, does nothing.
void clickSoon(const std::string& title);

}  // namespace onramp::conformance
