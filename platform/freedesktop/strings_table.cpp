#include "platform/freedesktop/strings_table.h"

#include <algorithm>
#include <array>
#include <utility>
#include <vector>

#include "base/ascii.h"
#include "base/text.h"
#include "platform/posix/file.h"
#include "platform/property_list.h"

namespace onramp {

namespace {

// Octal escapes encode characters of the NEXTSTEP character set. The lower half of that set is
// ASCII, and this table is the upper half.
constexpr std::array<char16_t, 128> kNextStepUpperHalf = {
    0x00A0, 0x00C0, 0x00C1, 0x00C2, 0x00C3, 0x00C4, 0x00C5, 0x00C7, 0x00C8, 0x00C9, 0x00CA, 0x00CB,
    0x00CC, 0x00CD, 0x00CE, 0x00CF, 0x00D0, 0x00D1, 0x00D2, 0x00D3, 0x00D4, 0x00D5, 0x00D6, 0x00D9,
    0x00DA, 0x00DB, 0x00DC, 0x00DD, 0x00DE, 0x00B5, 0x00D7, 0x00F7, 0x00A9, 0x00A1, 0x00A2, 0x00A3,
    0x2044, 0x00A5, 0x0192, 0x00A7, 0x00A4, 0x2019, 0x201C, 0x00AB, 0x2039, 0x203A, 0xFB01, 0xFB02,
    0x00AE, 0x2013, 0x2020, 0x2021, 0x00B7, 0x00A6, 0x00B6, 0x2022, 0x201A, 0x201E, 0x201D, 0x00BB,
    0x2026, 0x2030, 0x00AC, 0x00BF, 0x00B9, 0x02CB, 0x00B4, 0x02C6, 0x02DC, 0x00AF, 0x02D8, 0x02D9,
    0x00A8, 0x00B2, 0x02DA, 0x00B8, 0x00B3, 0x02DD, 0x02DB, 0x02C7, 0x2014, 0x00B1, 0x00BC, 0x00BD,
    0x00BE, 0x00E0, 0x00E1, 0x00E2, 0x00E3, 0x00E4, 0x00E5, 0x00E7, 0x00E8, 0x00E9, 0x00EA, 0x00EB,
    0x00EC, 0x00C6, 0x00ED, 0x00AA, 0x00EE, 0x00EF, 0x00F0, 0x00F1, 0x0141, 0x00D8, 0x0152, 0x00BA,
    0x00F2, 0x00F3, 0x00F4, 0x00F5, 0x00F6, 0x00E6, 0x00F9, 0x00FA, 0x00FB, 0x0131, 0x00FC, 0x00FD,
    0x0142, 0x00F8, 0x0153, 0x00DF, 0x00FE, 0x00FF, 0xFFFD, 0xFFFD};

bool isOctal(char c) {
  return c >= '0' && c <= '7';
}

bool isWordCharacter(char c) {
  constexpr std::string_view kPunctuation = "_$/:.-";
  return isASCIILetterOrDigit(c) || kPunctuation.find(c) != std::string_view::npos;
}

class Parser {
 public:
  Parser(std::string_view text, ParseProblem& problem)
      : text_(text), rest_(text), problem_(problem) {}

  std::optional<Dictionary> table() {
    const bool braces = skipBlanks() && take('{');
    std::vector<Dictionary::Pair> pairs;
    while (skipBlanks() && !rest_.empty() && rest_.front() != '}') {
      const bool full = pairs.size() == kMostPropertyListObjects;
      if (full) refuse("more texts than the limit allows", at());
      if (full || !entry(pairs)) return std::nullopt;
    }
    if (!problem_.reason.empty()) return std::nullopt;
    if (braces && !take('}')) refuse("\"}\" expected", lastEnd_);
    if (!skipBlanks() || !rest_.empty()) {
      refuse(braces ? "text after the closing \"}\"" : "a \"}\" without a \"{\"", at());
    }
    if (!problem_.reason.empty()) return std::nullopt;
    // If several pairs have the same key, the last must win, but a Dictionary keeps the first.
    std::reverse(pairs.begin(), pairs.end());
    return Dictionary(std::move(pairs));
  }

 private:
  [[nodiscard]] std::size_t at() const { return text_.size() - rest_.size(); }

  bool refuse(const char* reason, std::size_t where) {
    problem_.note(reason, where);
    return false;
  }

  bool entry(std::vector<Dictionary::Pair>& pairs) {
    const auto key = word("a key expected");
    if (!key || !skipBlanks()) return false;
    std::optional<std::string> text = key;
    const bool hasText = take('=');
    if (hasText) {
      if (!skipBlanks()) return false;
      text = word("a text expected after \"=\"");
      if (!text || !skipBlanks()) return false;
    }
    pairs.emplace_back(*key, std::move(*text));
    return take(';') || (!rest_.empty() && rest_.front() == '}') ||
           refuse(hasText ? "\";\" expected" : "\"=\" or \";\" expected", lastEnd_);
  }

  // Skips white space and comments. Refuses the file and returns false when a comment does not end.
  bool skipBlanks() {
    for (;;) {
      rest_.remove_prefix(std::min(rest_.find_first_not_of(" \t\n\v\f\r"), rest_.size()));
      if (rest_.starts_with("//")) {
        rest_.remove_prefix(std::min(rest_.find_first_of("\n\r"), rest_.size()));
      } else if (rest_.starts_with("/*")) {
        const std::size_t end = rest_.find("*/", 2);
        if (end == std::string_view::npos) return refuse("a comment that does not end", at());
        rest_.remove_prefix(end + 2);
      } else {
        return true;
      }
    }
  }

  bool take(char expected) {
    if (!rest_.starts_with(expected)) return false;
    rest_.remove_prefix(1);
    return true;
  }

  // Reads a word, with or without quotation marks. If no word begins here, refuses the file with
  // the reason `expected` and returns nothing. Also refuses the file and returns nothing if a
  // quotation mark is never closed.
  std::optional<std::string> word(const char* expected) {
    const std::size_t start = at();
    std::optional<std::string> word;
    if (take('"')) {
      word = quoted('"');
    } else if (take('\'')) {
      word = quoted('\'');
    } else {
      const auto* const end = std::find_if_not(rest_.begin(), rest_.end(), isWordCharacter);
      if (end == rest_.begin()) {
        refuse(expected, start);
        return std::nullopt;
      }
      word = std::string(rest_.begin(), end);
      rest_.remove_prefix(word->size());
    }
    if (!word) refuse("a quotation mark that is never closed", start);
    lastEnd_ = at();
    return word;
  }

  std::optional<std::string> quoted(char quote) {
    const std::string ends{'\\', quote};
    std::string text;
    while (!rest_.empty()) {
      if (take(quote)) return text;
      const std::size_t special = std::min(rest_.find_first_of(ends), rest_.size());
      text += rest_.substr(0, special);
      rest_.remove_prefix(special);
      if (take('\\') && !escape(text)) return std::nullopt;
    }
    return std::nullopt;
  }

  bool escape(std::string& text) {
    if (rest_.empty()) return false;
    const char name = rest_.front();
    if (isOctal(name)) {
      appendUTF8(text, octal());
      return true;
    }
    rest_.remove_prefix(1);
    constexpr std::string_view kNames = "abfnrtv";
    constexpr std::string_view kMeanings = "\a\b\f\n\r\t\v";
    const std::size_t index = kNames.find(name);
    if (name == 'U') {
      appendUTF8(text, unicode());
    } else {
      text += index == std::string_view::npos ? name : kMeanings[index];
    }
    return true;
  }

  // Reads a code of up to three octal digits and returns its character.
  char32_t octal() {
    char32_t code = 0;
    for (int i = 0; i < 3 && !rest_.empty() && isOctal(rest_.front()); ++i) {
      code = code << 3 | static_cast<char32_t>(rest_.front() - '0');
      rest_.remove_prefix(1);
    }
    code &= 0xFF;
    return code < 0x80 ? code : kNextStepUpperHalf[code - 0x80];
  }

  // Reads up to four hexadecimal digits, which name a UTF-16 unit, and returns the character. If
  // the unit is the first of a surrogate pair, also reads the second one.
  char32_t unicode() {
    const char32_t first = unit();
    if (!isLeadSurrogate(first) || !rest_.starts_with("\\U")) return first;
    const std::string_view before = rest_;
    rest_.remove_prefix(2);
    const char32_t second = unit();
    if (isTrailSurrogate(second)) return joinedSurrogates(first, second);
    rest_ = before;
    return kReplacementCharacter;
  }

  char32_t unit() {
    char32_t code = 0;
    for (int i = 0; i < 4 && !rest_.empty(); ++i) {
      const auto digit = hexDigitValue(rest_.front());
      if (!digit) break;
      code = code << 4 | *digit;
      rest_.remove_prefix(1);
    }
    return code;
  }

  std::string_view text_;
  std::string_view rest_;
  ParseProblem& problem_;
  std::size_t lastEnd_ = 0;  ///< end of the last key or text; missing punctuation is reported there
};

}  // namespace

std::optional<Dictionary> parseStrings(std::string_view text) {
  ParseProblem unused;
  return parseStrings(text, unused);
}

std::optional<Dictionary> parseStrings(std::string_view text, ParseProblem& problem) {
  return Parser(text, problem).table();
}

std::optional<Dictionary> loadStringsTable(const std::string& path) {
  const auto bytes = posix::readFile(path, kMostPropertyListBytes);
  if (!bytes) return std::nullopt;
  if (bytes->starts_with("bplist")) return loadDictionary(path);
  const auto text = decodedText(*bytes);
  if (!text) return std::nullopt;
  const std::size_t first = text->find_first_not_of(" \t\r\n");
  if (first != std::string::npos && (*text)[first] == '<') return loadDictionary(path);
  return parseStrings(*text);
}

}  // namespace onramp
