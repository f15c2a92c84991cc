#pragma once

#include <string>

namespace onramp::check {

/// The usual name of the wizard's application. checkMedium() assumes it for a medium without an
/// application.
inline constexpr const char* kUsualName = "Onramp OSX.app";

/// Returns the name of the application in `root`, the medium's top folder. If there are several,
/// returns the first in alphabetical order whose name is kUsualName or whose Info.plist has
/// "CommonResourcePath". If there is no such application, returns the alphabetically first one.
/// Returns an empty string when there is none at all.
[[nodiscard]] std::string findApplication(const std::string& root);

/// Returns whether the application `name` in the folder `root` is a wizard: its name is kUsualName,
/// or its Info.plist has "CommonResourcePath".
[[nodiscard]] bool isWizard(const std::string& root, const std::string& name);

}  // namespace onramp::check
