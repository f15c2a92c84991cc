#pragma once

#include <cstddef>
#include <string>
#include <string_view>

namespace onramp::devices {

/// Returns `name` in quotation marks, safe to show on any terminal. A space at either end or after
/// another space becomes "␣". Bytes that are not printable text become "\xNN".
[[nodiscard]] std::string inQuotes(std::string_view name);

/// Returns how many columns a UTF-8 text takes on a terminal.
[[nodiscard]] std::size_t columnsOf(std::string_view text);

/// Returns `text` in exactly `columns` columns: padded with spaces, or cut and ended with "…".
[[nodiscard]] std::string fitted(std::string_view text, std::size_t columns);

/// Returns `text` broken at spaces into lines of at most `width` columns. Each line starts with
/// `indent` spaces and ends with a line feed. A longer word gets its own line.
[[nodiscard]] std::string wrapped(std::string_view text, std::size_t width, std::size_t indent);

/// Returns a duration, given in seconds, as text such as "0.4 ms" or "12.1 s".
[[nodiscard]] std::string durationText(double seconds);

}  // namespace onramp::devices
