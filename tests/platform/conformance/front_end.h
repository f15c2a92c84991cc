#pragma once

#include <string>

#include "platform/outlets.h"

namespace onramp::conformance {

/// The application's window.
[[nodiscard]] const Window& window();

/// Does what a user does who clicks the button with the title `title` in an alert or a sheet, once
/// there is such a button. Each front end defines it. Returns at once.
void clickSoon(const std::string& title);

}  // namespace onramp::conformance
