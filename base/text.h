#pragma once

#include <cstdint>
#include <optional>
#include <string>
#include <string_view>

namespace onramp {

/// Unicode's replacement character, which replaces a malformed or forbidden character.
inline constexpr char32_t kReplacementCharacter = 0xFFFD;

/// Appends `character` to `text` in UTF-8. Appends the replacement character for a surrogate or a
/// value above U+10FFFF.
void appendUTF8(std::string& text, char32_t character);

/// Removes the first character from `text` and returns it. If `text` does not begin with
/// well-formed UTF-8 (RFC 3629), removes one byte and returns nothing. `text` must not be empty.
std::optional<char32_t> takeUTF8(std::string_view& text);

/// Whether `text` is well-formed UTF-8 (RFC 3629): no overlong forms, no surrogates, nothing above
/// U+10FFFF.
[[nodiscard]] bool isUTF8(std::string_view text);

/// Whether a UTF-16 unit is the first half of a surrogate pair.
[[nodiscard]] constexpr bool isLeadSurrogate(char32_t unit) {
  return unit >= 0xD800 && unit <= 0xDBFF;
}

/// Whether a UTF-16 unit is the second half of a surrogate pair.
[[nodiscard]] constexpr bool isTrailSurrogate(char32_t unit) {
  return unit >= 0xDC00 && unit <= 0xDFFF;
}

/// Returns the character that a lead and a trail surrogate encode together.
[[nodiscard]] constexpr char32_t joinedSurrogates(char32_t lead, char32_t trail) {
  return 0x10000 + ((lead - 0xD800) << 10) + (trail - 0xDC00);
}

/// Converts the contents of a text file, in UTF-8 or UTF-16, to UTF-8 without a byte-order mark. A
/// file without a byte-order mark counts as UTF-16 if one of its first two bytes is zero, otherwise
/// as UTF-8. This works because every text file that the program reads begins with an ASCII
/// character, which contains a zero byte only in UTF-16. Returns nothing when the bytes are
/// malformed.
[[nodiscard]] std::optional<std::string> decodedText(std::string_view bytes);

/// Whether `text` is valid as the path, query and fragment of a URL (RFC 3986): it contains only
/// characters that these parts may contain, at most one "#", and two hexadecimal digits after every
/// "%". An empty string is valid.
[[nodiscard]] bool isURLText(std::string_view text);

}  // namespace onramp
