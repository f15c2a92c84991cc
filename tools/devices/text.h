#pragma once

#include <cstddef>
#include <string>
#include <string_view>

namespace onramp::devices {

/// A name in quotation marks as it can be shown anywhere: blanks at its edges and all but the first
/// of a row are "␣", and bytes that are no printable text are "\xNN".
[[nodiscard]] std::string inQuotes(std::string_view name);

/// The columns that a text in UTF-8 takes on a terminal.
[[nodiscard]] std::size_t columnsOf(std::string_view text);

/// `text` in exactly `columns` columns: filled up with blanks, or cut with "…" at its end.
[[nodiscard]] std::string fitted(std::string_view text, std::size_t columns);

/// `text` broken at blanks into lines of at most `width` columns, each after `indent` blanks and
/// with a line feed at its end. A longer word has a line for itself.
[[nodiscard]] std::string wrapped(std::string_view text, std::size_t width, std::size_t indent);

/// A duration in seconds, such as "0.4 ms" or "12.1 s".
[[nodiscard]] std::string durationText(double seconds);

}  // namespace onramp::devices
