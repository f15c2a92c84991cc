#pragma once

#include <cstdint>
#include <optional>
#include <string>

namespace onramp {

/// Returns the version of macOS as a text, such as "10.15.7". This is the running version or, with
/// the backend standin, the version that the program assumes. Returns nothing when the system does
/// not report its version.
[[nodiscard]] std::optional<std::string> productVersion();

/// Returns the same version in binary-coded decimal, in the format of the "sysv" selector of
/// macOS's Gestalt(). For example, 0x1068 means 10.6.8. A minor or bug-fix number above 9 is given
/// as 9. Returns nothing when the system does not report its version.
[[nodiscard]] std::optional<std::int32_t> gestaltSystemVersion();

}  // namespace onramp
