#include "tools/check/unreadable.h"

#include <algorithm>
#include <filesystem>
#include <sstream>
#include <string_view>
#include <system_error>

#include "base/ascii.h"
#include "base/text.h"
#include "platform/freedesktop/strings_table.h"
#include "platform/libplist/parse.h"
#include "platform/posix/file.h"
#include "platform/property_list.h"
#include "tools/check/xml_lines.h"

namespace onramp::check {

namespace {

namespace fs = std::filesystem;

std::size_t lineOf(const std::string& text, std::size_t offset) {
  const auto end = text.begin() + static_cast<std::ptrdiff_t>(std::min(offset, text.size()));
  return 1 + static_cast<std::size_t>(std::count(text.begin(), end, '\n'));
}

// Returns the offset of the first byte of `bytes` that is not part of a character in UTF-8, or the
// number of bytes if there is none.
std::size_t malformedAt(const std::string& bytes) {
  std::string_view rest = bytes;
  while (!rest.empty()) {
    const std::size_t left = rest.size();
    if (!takeUTF8(rest)) return bytes.size() - left;
  }
  return bytes.size();
}

// Returns the remedy for a common mistake with quotation marks at `offset` of the strings table
// `text`. Returns an empty string if there is no such mistake.
std::string remedyForQuotes(std::string_view text, std::size_t offset) {
  std::string_view rest = text.substr(std::min(offset, text.size()));
  rest.remove_prefix(std::min(rest.find_first_not_of(" \t"), rest.size()));
  const bool isAfterMark = offset > 0 && offset <= text.size() && text[offset - 1] == '"';
  const bool isBeforeWord =
      !rest.empty() && (isASCIILetterOrDigit(rest.front()) || (rest.front() & 0x80) != 0);
  if (isAfterMark && isBeforeWord)
    return "write a quotation mark inside a text as \\\", or put the missing \";\" there";
  for (const char* const mark : {"\u201C", "\u201D", "\u201E", "\u00AB", "\u00BB"}) {
    if (rest.starts_with(mark)) return "write straight quotation marks (\") around keys and texts";
  }
  return "";
}

// Returns whether `line` has an "&" that does not begin an entity such as "&amp;" or "&#38;".
bool hasBareAmpersand(std::string_view line) {
  for (std::size_t at = line.find('&'); at != std::string_view::npos; at = line.find('&', at + 1)) {
    const std::string_view rest = line.substr(at + 1);
    const auto* const end = std::find_if_not(
        rest.begin(), rest.end(), [](char c) { return c == '#' || isASCIILetterOrDigit(c); });
    if (end == rest.begin() || end == rest.end() || *end != ';') return true;
  }
  return false;
}

// Returns the remedy for a mistake on line `number` of the XML text `text`, or an empty string if
// that line has no bare "&".
std::string remedyForAmpersand(const std::string& text, std::size_t number) {
  std::istringstream lines(text);
  std::string line;
  for (std::size_t i = 0; i < number; ++i)
    std::getline(lines, line);
  return hasBareAmpersand(line) ? "write \"&\" as \"&amp;\"" : "";
}

// Adds to `finding` the reason why the wizard cannot read `bytes`, a file's contents, and the
// mistake's line or byte. `isStrings` says whether the file is a strings table.
void explain(const std::string& bytes, bool isStrings, Finding& finding) {
  ParseProblem problem;
  const auto text = bytes.starts_with("bplist") ? std::nullopt : decodedText(bytes);
  const auto value = isStrings && text && !isXML(*text)
                         ? std::optional<Value>()
                         : libplist::parsePropertyList(bytes, problem);
  if (isStrings && text && !isXML(*text)) static_cast<void>(parseStrings(*text, problem));
  if (value) {
    finding.found = "a property list whose outermost value is not a dictionary";
    finding.expected = "a dictionary";
    return;
  }
  finding.found = problem.reason;
  if (text) {
    finding.place.line = lineOf(*text, problem.offset);
    if (isStrings) finding.remedy = remedyForQuotes(*text, problem.offset);
  } else if (isStrings && !bytes.starts_with("bplist")) {
    finding.place.line = lineOf(bytes, malformedAt(bytes));
    finding.remedy = "save the file as UTF-8";
  } else {
    finding.place.byte = problem.offset;
  }
  if (!finding.found.empty()) return;
  const XMLLines lines = text ? xmlLines(*text) : XMLLines();
  finding.found = lines.problem.empty() ? "not a property list" : lines.problem;
  if (lines.problemLine == 0) return;
  finding.place.line = lines.problemLine;
  if (lines.problem.starts_with("not well-formed"))
    finding.remedy = remedyForAmpersand(*text, lines.problemLine);
}

}  // namespace

void explainUnreadable(const std::string& path, bool isStrings, Finding& finding) {
  std::error_code ignored;
  if (fs::is_directory(path, ignored)) {
    finding.found = "a folder";
    finding.expected = "a property list";
  } else if (const auto size = fs::file_size(path, ignored);
             !ignored && size > kMostPropertyListBytes) {
    finding.found = std::to_string(size) + " bytes";
    finding.expected = "at most " + std::to_string(kMostPropertyListBytes) + " bytes";
    finding.remedy =
        "remove what the wizard does not read, or divide the models among several media";
  } else if (const auto bytes = posix::readFile(path, kMostPropertyListBytes); !bytes) {
    finding.found = "a file that cannot be read";
    finding.remedy = "let everyone read it (chmod a+r)";
  } else if (bytes->empty()) {
    finding.found = "an empty file";
  } else {
    explain(*bytes, isStrings, finding);
  }
  const bool isSyntax = isStrings && finding.place.line;
  if (finding.expected.empty() && !isSyntax) {
    finding.expected =
        isStrings ? "lines of the form \"key\" = \"text\";" : "a property list, XML or binary";
  }
  if (finding.remedy.empty()) {
    finding.remedy = finding.place.line ? "correct that line or the one before it"
                                        : "replace the file with an undamaged copy";
  }
}

}  // namespace onramp::check
