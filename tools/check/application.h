#pragma once

#include <string>

namespace onramp::check {

/// The application's usual name, assumed for a medium without an application.
inline constexpr const char* kUsualName = "Onramp OSX.app";

/// Returns the name of the application at the top of the medium in the folder `root`. If there are
/// several, returns the first one in alphabetical order that looks like the wizard, or the first of
/// all if none does. Returns an empty string when there is no application.
[[nodiscard]] std::string findApplication(const std::string& root);

}  // namespace onramp::check
