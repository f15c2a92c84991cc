#pragma once

#include <cstdint>
#include <optional>
#include <string>

namespace onramp {

/// Returns the version of macOS, such as "10.15.7". The backend `standin` returns the version of
/// macOS that the program is to assume, whatever system it runs on. Returns nothing when the system
/// does not report its version.
[[nodiscard]] std::optional<std::string> productVersion();

/// Returns the same version in binary-coded decimal, in the format that the macOS function
/// Gestalt() uses for the selector "sysv". For example, 0x1068 means 10.6.8. A minor or bug-fix
/// number above 9 becomes
/// 9. Returns nothing when the system does not report its version.
[[nodiscard]] std::optional<std::int32_t> gestaltSystemVersion();

}  // namespace onramp
