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
  double width = 0;  ///< of a line, in points; 0 where there is room enough for any text
  double size = 13;  ///< of the letters, in points
  int lines = 1;
  std::size_t mostPlaceholders = 0;  ///< of "%@": at least one must occur; 0: none may occur
  bool hasFallback = false;          ///< a missing text is shown in English, not as its key
};

/// Returns all texts that the wizard shows, in the order of their keys.
[[nodiscard]] std::span<const ShownText> shownTexts();

/// Returns the approximate width in points of `text` (UTF-8) in letters of `size` points. The
/// estimate uses an average width for each class of characters and no font.
[[nodiscard]] double estimatedWidth(std::string_view text, double size);

/// Returns the approximate number of lines of `width` points that `text` takes. The estimate
/// assumes that a line can break anywhere.
[[nodiscard]] int estimatedLines(std::string_view text, double size, double width);

}  // namespace onramp::check
