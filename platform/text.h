#pragma once

#include <cstdint>
#include <optional>
#include <string>
#include <string_view>

namespace onramp {

/// Stands for a character that cannot be told (U+FFFD).
inline constexpr char32_t kReplacementCharacter = 0xFFFD;

/// Appends `character` to `text` in UTF-8; a surrogate, or a value past the range, as the
/// replacement character.
void appendUTF8(std::string& text, char32_t character);

/// Takes one character off the front of a UTF-8 text that is not empty. A byte that begins no
/// well-formed sequence (RFC 3629) gives nothing and is taken off alone.
std::optional<char32_t> takeUTF8(std::string_view& text);

/// The text of a file in UTF-8 or UTF-16, as UTF-8 without a byte-order mark. UTF-16 is told by its
/// mark or, as the first character of our files is an ASCII one, by a zero byte among the first
/// two. Nothing when the bytes are not well formed.
[[nodiscard]] std::optional<std::string> decodedText(std::string_view bytes);

}  // namespace onramp
