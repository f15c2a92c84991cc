#pragma once

#include <cstdint>
#include <optional>
#include <string>

namespace onramp {

/// The running system's "ProductVersion", such as "10.15.7"; nothing when the
/// system does not tell.
[[nodiscard]] std::optional<std::string> productVersion();

/// The running system's version in binary-coded decimal, in the format of the "sysv" selector:
/// 0x1068 means 10.6.8, and a minor or bug-fix number above 9 is given as 9. Nothing when the
/// system does not tell.
[[nodiscard]] std::optional<std::int32_t> gestaltSystemVersion();

}  // namespace onramp
