#include "base/text.h"

#include <algorithm>

#include "base/ascii.h"

namespace onramp {

namespace {

constexpr std::string_view kUTF8Mark = "\xEF\xBB\xBF";

unsigned char byteAt(std::string_view bytes, std::size_t index) {
  return static_cast<unsigned char>(bytes[index]);
}

bool isASCII(char c) {
  return static_cast<unsigned char>(c) < 0x80;
}

std::optional<std::string> fromUTF16(std::string_view bytes, bool bigEndian) {
  if (bytes.size() % 2 != 0) return std::nullopt;
  const auto unitAt = [&](std::size_t index) {
    const char32_t first = byteAt(bytes, 2 * index);
    const char32_t second = byteAt(bytes, 2 * index + 1);
    return bigEndian ? first << 8 | second : second << 8 | first;
  };
  const std::size_t units = bytes.size() / 2;
  std::string text;
  text.reserve(units);
  for (std::size_t i = 0; i < units; ++i) {
    char32_t character = unitAt(i);
    if (isTrailSurrogate(character)) return std::nullopt;
    if (isLeadSurrogate(character)) {
      if (++i == units || !isTrailSurrogate(unitAt(i))) return std::nullopt;
      character = joinedSurrogates(character, unitAt(i));
    }
    appendUTF8(text, character);
  }
  return text;
}

std::optional<std::string> fromUTF8(std::string_view bytes) {
  if (bytes.starts_with(kUTF8Mark)) bytes.remove_prefix(kUTF8Mark.size());
  std::string_view rest = bytes;
  for (;;) {
    const auto* const end = std::find_if_not(rest.begin(), rest.end(), isASCII);
    rest.remove_prefix(static_cast<std::size_t>(end - rest.begin()));
    if (rest.empty()) return std::string(bytes);
    if (!takeUTF8(rest)) return std::nullopt;
  }
}

}  // namespace

void appendUTF8(std::string& text, char32_t character) {
  if (isLeadSurrogate(character) || isTrailSurrogate(character) || character > 0x10FFFF) {
    character = kReplacementCharacter;
  }
  const auto tail = [&](int shift) {
    return static_cast<char>(0x80 | ((character >> shift) & 0x3F));
  };
  if (character < 0x80) {
    text += static_cast<char>(character);
  } else if (character < 0x800) {
    text += {static_cast<char>(0xC0 | (character >> 6)), tail(0)};
  } else if (character < 0x10000) {
    text += {static_cast<char>(0xE0 | (character >> 12)), tail(6), tail(0)};
  } else {
    text += {static_cast<char>(0xF0 | (character >> 18)), tail(12), tail(6), tail(0)};
  }
}

std::optional<char32_t> takeUTF8(std::string_view& text) {
  const unsigned char lead = byteAt(text, 0);
  const std::string_view from = text;
  text.remove_prefix(1);
  if (lead < 0x80) return lead;
  const std::size_t length = lead >= 0xF0 ? 4 : lead >= 0xE0 ? 3 : 2;
  if (lead < 0xC2 || lead > 0xF4 || from.size() < length) return std::nullopt;

  char32_t character = lead & (0x7FU >> length);
  for (std::size_t i = 1; i < length; ++i) {
    const unsigned char byte = byteAt(from, i);
    if ((byte & 0xC0) != 0x80) return std::nullopt;
    character = character << 6 | (byte & 0x3FU);
  }
  constexpr char32_t kLeast[] = {0, 0, 0x80, 0x800, 0x10000};
  if (character < kLeast[length] || character > 0x10FFFF || isLeadSurrogate(character) ||
      isTrailSurrogate(character)) {
    return std::nullopt;
  }
  text.remove_prefix(length - 1);
  return character;
}

bool isUTF8(std::string_view text) {
  while (!text.empty()) {
    if (!takeUTF8(text)) return false;
  }
  return true;
}

std::optional<std::string> decodedText(std::string_view bytes) {
  if (bytes.starts_with("\xFE\xFF")) return fromUTF16(bytes.substr(2), true);
  if (bytes.starts_with("\xFF\xFE")) return fromUTF16(bytes.substr(2), false);
  if (bytes.size() >= 2 && bytes[0] == '\0') return fromUTF16(bytes, true);
  if (bytes.size() >= 2 && bytes[1] == '\0') return fromUTF16(bytes, false);
  return fromUTF8(bytes);
}

bool isURLText(std::string_view text) {
  constexpr std::string_view kPunctuation = "-._~:/?#@!$&'()*+,;=";
  for (std::size_t at = 0; at < text.size(); ++at) {
    const char c = text[at];
    if (c == '%') {
      if (at + 2 >= text.size() || !hexDigitValue(text[at + 1]) || !hexDigitValue(text[at + 2])) {
        return false;
      }
    } else if (!isASCIILetterOrDigit(c) && kPunctuation.find(c) == std::string_view::npos) {
      return false;
    }
  }
  return std::count(text.begin(), text.end(), '#') <= 1;
}

}  // namespace onramp
