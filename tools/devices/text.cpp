#include "tools/devices/text.h"

#include <array>
#include <cstdio>

#include "base/text.h"

namespace onramp::devices {

namespace {

constexpr std::string_view kVisibleBlank = "␣";

void appendEscaped(std::string& out, char byte) {
  std::array<char, 5> text{};
  std::snprintf(text.data(), text.size(), "\\x%02x", static_cast<unsigned char>(byte));
  out += text.data();
}

// Returns whether the character is invisible: a control character, a line or paragraph separator, a
// zero-width space or joiner, or a mark that changes the text direction.
bool isUnprintable(char32_t character) {
  return character < 0x20 || (character >= 0x7f && character < 0xa0) ||
         (character >= 0x200b && character <= 0x200f) ||
         (character >= 0x2028 && character <= 0x202e) ||
         (character >= 0x2066 && character <= 0x2069) || character == 0xfeff;
}

}  // namespace

std::string inQuotes(std::string_view name) {
  std::string out = "\"";
  bool afterBlank = true;
  std::string_view rest = name;
  while (!rest.empty()) {
    const std::string_view before = rest;
    const auto character = takeUTF8(rest);
    const std::string_view bytes = before.substr(0, before.size() - rest.size());
    if (!character || isUnprintable(*character)) {
      for (const char byte : bytes)
        appendEscaped(out, byte);
    } else if (*character == ' ' && (afterBlank || rest.empty())) {
      out += kVisibleBlank;
    } else {
      out += bytes;
    }
    afterBlank = character == U' ';
  }
  return out + '"';
}

std::string durationText(double seconds) {
  std::array<char, 32> text{};
  if (seconds < 1) {
    std::snprintf(text.data(), text.size(), "%.1f ms", seconds * 1000);
  } else {
    std::snprintf(text.data(), text.size(), "%.1f s", seconds);
  }
  return text.data();
}

}  // namespace onramp::devices
