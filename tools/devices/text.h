#pragma once

#include <cstddef>
#include <string>
#include <string_view>

namespace onramp::devices {

/// Returns the UTF-8 text `name` in quotation marks, without anything that could control the
/// terminal. A space at either end or after another space becomes "␣". A byte that is not part of
/// printable text becomes "\xNN", where NN is its value in hexadecimal.
[[nodiscard]] std::string inQuotes(std::string_view name);

/// Returns a duration, given in seconds, as a string such as "0.4 ms" or "12.1 s".
[[nodiscard]] std::string durationText(double seconds);

}  // namespace onramp::devices
