#pragma once

#include <cstdint>
#include <optional>
#include <string>
#include <string_view>

namespace onramp {

/// Stands for a character that cannot be decoded (U+FFFD).
inline constexpr char32_t kReplacementCharacter = 0xFFFD;

/// Appends `character` to `text` in UTF-8. A surrogate, or a value above U+10FFFF, is appended as
/// the replacement character.
void appendUTF8(std::string& text, char32_t character);

/// Removes one character from the front of `text`, which is UTF-8 and not empty, and returns it. A
/// byte that begins no well-formed sequence (RFC 3629) is removed alone, and nothing is returned.
std::optional<char32_t> takeUTF8(std::string_view& text);

/// Whether `text` is well-formed UTF-8 (RFC 3629): no overlong forms, no surrogates, nothing above
/// U+10FFFF.
[[nodiscard]] bool isUTF8(std::string_view text);

/// Whether a UTF-16 unit is the first or the second half of a pair.
[[nodiscard]] constexpr bool isLeadSurrogate(char32_t unit) {
  return unit >= 0xD800 && unit <= 0xDBFF;
}
[[nodiscard]] constexpr bool isTrailSurrogate(char32_t unit) {
  return unit >= 0xDC00 && unit <= 0xDFFF;
}

/// The character that a lead and a trail surrogate stand for together.
[[nodiscard]] constexpr char32_t joinedSurrogates(char32_t lead, char32_t trail) {
  return 0x10000 + ((lead - 0xD800) << 10) + (trail - 0xDC00);
}

/// The text of a file in UTF-8 or UTF-16, as UTF-8 without a byte-order mark. A mark tells UTF-16;
/// without one a zero byte among the first two does, because our files begin with an ASCII
/// character. Nothing when the bytes are not well formed.
[[nodiscard]] std::optional<std::string> decodedText(std::string_view bytes);

}  // namespace onramp
