#pragma once

#include <string>

namespace onramp::check {

/// What the application is called where a medium does not show it.
inline constexpr const char* kUsualName = "Onramp OSX.app";

/// Returns the name of the application at the top of the medium in the folder `root`: of several
/// the first one that looks like the wizard. Empty when there is none.
[[nodiscard]] std::string findApplication(const std::string& root);

}  // namespace onramp::check
