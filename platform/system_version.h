#pragma once

#include <cstdint>
#include <optional>
#include <string>

namespace onramp {

/// The running system's "ProductVersion", such as "10.15.7"; nothing when it cannot be read.
[[nodiscard]] std::optional<std::string> productVersion();

/// The running system's version in binary-coded decimal, as the "sysv" selector gives it: 0x1068 is
/// 10.6.8, and a minor or bug-fix value above 9 reads as 9. Nothing when the system has no answer.
[[nodiscard]] std::optional<std::int32_t> gestaltSystemVersion();

}  // namespace onramp
