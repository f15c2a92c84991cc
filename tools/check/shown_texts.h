#pragma once

#include <cstddef>
#include <span>
#include <string>
#include <string_view>

namespace onramp::check {

/// A text that the wizard shows, by its key in the message bundle. Widths are those of the
/// interface files for macOS.
struct ShownText {
  std::string_view key{};
  std::string_view where{};
  double width = 0;  ///< of a line, in points; 0 where the text has room enough
  double size = 13;  ///< of the letters, in points
  int lines = 1;
  std::size_t mostPlaceholders = 0;  ///< "%@" is filled in once or up to this often
  bool hasFallback = false;          ///< an English text stands in for a missing one, not the key
};

/// Every text, in the order of their keys.
[[nodiscard]] std::span<const ShownText> shownTexts();

/// About how wide `text` (UTF-8) is in letters of `size` points: an estimate by classes of
/// characters, which no font has exactly. In points.
[[nodiscard]] double estimatedWidth(std::string_view text, double size);

/// About how many lines of `width` points `text` takes; it breaks anywhere.
[[nodiscard]] int estimatedLines(std::string_view text, double size, double width);

}  // namespace onramp::check
