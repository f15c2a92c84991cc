#include "tools/devices/text.h"

#include <array>
#include <cstdio>

#include "base/text.h"
#include "platform/terminal.h"

namespace onramp::devices {

namespace {

constexpr std::string_view kVisibleBlank = "␣";
constexpr std::string_view kCut = "…";

void appendEscaped(std::string& out, char byte) {
  std::array<char, 5> text{};
  std::snprintf(text.data(), text.size(), "\\x%02x", static_cast<unsigned char>(byte));
  out += text.data();
}

// Returns whether the character is invisible: a control character, a separator, or a mark that
// changes the direction of the text after it.
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

std::size_t columnsOf(std::string_view text) {
  std::size_t columns = 0;
  while (!text.empty()) {
    if (const auto character = takeUTF8(text)) columns += onramp::columnsOf(*character);
  }
  return columns;
}

std::string fitted(std::string_view text, std::size_t columns) {
  const std::size_t width = columnsOf(text);
  if (width <= columns) return std::string(text) + std::string(columns - width, ' ');
  std::string out;
  std::size_t used = 0;
  while (!text.empty()) {
    const std::string_view before = text;
    const auto character = takeUTF8(text);
    const std::size_t more = character ? onramp::columnsOf(*character) : 0;
    if (used + more + 1 > columns) break;
    out += before.substr(0, before.size() - text.size());
    used += more;
  }
  if (columns == 0) return out;
  return out + std::string(kCut) + std::string(columns - used - 1, ' ');
}

std::string wrapped(std::string_view text, std::size_t width, std::size_t indent) {
  std::string out;
  std::string line;
  const auto endLine = [&] {
    if (!line.empty()) out += std::string(indent, ' ') + line + '\n';
    line.clear();
  };
  while (!text.empty()) {
    const std::size_t blank = text.find(' ');
    const std::string_view word = text.substr(0, blank);
    text.remove_prefix(blank == std::string_view::npos ? text.size() : blank + 1);
    if (!line.empty() && indent + columnsOf(line) + 1 + columnsOf(word) > width) endLine();
    if (!line.empty()) line += ' ';
    line += word;
  }
  endLine();
  return out;
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
