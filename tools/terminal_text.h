#pragma once

#include <cstddef>
#include <string>
#include <string_view>

namespace onramp {

/// Returns how many columns a UTF-8 text takes on a terminal.
[[nodiscard]] std::size_t columnsOf(std::string_view text);

/// Returns `text` in exactly `columns` columns: padded with spaces, or cut and ended with "…".
[[nodiscard]] std::string fitted(std::string_view text, std::size_t columns);

/// Returns `text` broken at spaces into lines of at most `width` columns. Each line starts with
/// `indent` spaces and ends with a line feed. A longer word gets its own line.
[[nodiscard]] std::string wrapped(std::string_view text, std::size_t width, std::size_t indent);

}  // namespace onramp
