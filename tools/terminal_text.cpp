#include "tools/terminal_text.h"

#include "base/text.h"
#include "platform/terminal.h"

namespace onramp {

namespace {

constexpr std::string_view kCut = "…";

}  // namespace

std::size_t columnsOf(std::string_view text) {
  std::size_t columns = 0;
  while (!text.empty()) {
    if (const auto character = takeUTF8(text)) columns += columnsOf(*character);
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
    const std::size_t more = character ? columnsOf(*character) : 0;
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

}  // namespace onramp
