#pragma once

#include <cstddef>
#include <string>
#include <string_view>

namespace onramp {

/// Returns the number of columns that the UTF-8 text `text` takes on a terminal.
[[nodiscard]] std::size_t columnsOf(std::string_view text);

/// Returns the UTF-8 text `text`, padded with spaces or cut to exactly `columns` columns. Text that
/// was cut ends with "…", except when `columns` is 0.
[[nodiscard]] std::string fitted(std::string_view text, std::size_t columns);

/// Returns `text`, broken at spaces into lines of at most `width` columns. Each line starts with
/// `indent` spaces, which count as columns, and ends with a line feed. A word that is too wide for
/// any line is not broken.
[[nodiscard]] std::string wrapped(std::string_view text, std::size_t width, std::size_t indent);

}  // namespace onramp
