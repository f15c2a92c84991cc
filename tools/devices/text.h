#pragma once

#include <cstddef>
#include <string>
#include <string_view>

namespace onramp::devices {

/// Returns `name` in quotation marks, safe to show on any terminal. A space at either end or after
/// another space becomes "␣". Bytes that are not printable text become "\xNN".
[[nodiscard]] std::string inQuotes(std::string_view name);

/// Returns a duration, given in seconds, as text such as "0.4 ms" or "12.1 s".
[[nodiscard]] std::string durationText(double seconds);

}  // namespace onramp::devices
