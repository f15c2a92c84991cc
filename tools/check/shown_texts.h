#pragma once

#include <cstddef>
#include <span>
#include <string>
#include <string_view>

namespace onramp::check {

/// A text of the message bundle that the wizard shows, and the room for it in the interface files
/// for macOS.
struct ShownText {
  std::string_view key{};    ///< in the message bundle
  std::string_view where{};  ///< the place where the text is shown, in words
  double width = 0;          ///< of a line, in points; 0 where any text fits
  double size = 13;          ///< of the font, in points
  int lines = 1;             ///< how many lines there is room for
  /// The maximum number of "%@". If it is not 0, at least one "%@" is required.
  std::size_t mostPlaceholders = 0;
  /// Whether English text, rather than the key, is shown when the bundle lacks the text.
  bool hasFallback = false;
};

/// Returns all texts that the wizard shows from the message bundle, in the order of their keys.
[[nodiscard]] std::span<const ShownText> shownTexts();

/// Returns the approximate width, in points, of `text` (UTF-8) in a font of `size` points. Instead
/// of a font, the estimate uses an average width for each class of characters.
[[nodiscard]] double estimatedWidth(std::string_view text, double size);

/// Returns the approximate number of lines that `text` takes in a font of `size` points, if a line
/// is `width` points wide. The estimate assumes that a line can break anywhere.
[[nodiscard]] int estimatedLines(std::string_view text, double size, double width);

}  // namespace onramp::check
