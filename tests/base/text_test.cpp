#include "base/text.h"

#include <gtest/gtest.h>

#include <string>

#include "base/ascii.h"

namespace onramp {
namespace {

using namespace std::literals;

// Decodes the characters of `bytes` and encodes them again. A byte that is not part of a valid
// character becomes "?".
std::string readAndWritten(std::string_view bytes) {
  std::string text;
  while (!bytes.empty()) {
    const auto character = takeUTF8(bytes);
    appendUTF8(text, character.value_or('?'));
  }
  return text;
}

TEST(UTF8, ReadsWholeCharactersAndRefusesEachMalformedByte) {
  for (const char* const whole :
       {"", "a\x7F", "\u0080\u07FF", "\u0800\uD7FF\uE000\uFFFF", "\U00010000\U0010FFFF"}) {
    EXPECT_EQ(readAndWritten(whole), whole);
    EXPECT_TRUE(isUTF8(whole)) << whole;
  }
  for (const char* const broken :
       {"\x80", "\xC1\xBF", "\xE0\x9F\xBF", "\xF0\x8F\xBF\xBF", "\xED\xA0\x80", "\xF4\x90\x80\x80",
        "\xF5\x80\x80\x80", "\xE3\x81"}) {
    const std::string refused(std::string_view(broken).size(), '?');
    EXPECT_EQ(readAndWritten(broken + "z"s), refused + 'z');
    EXPECT_EQ(readAndWritten(broken), refused);
    EXPECT_FALSE(isUTF8(broken)) << testing::PrintToString(broken);
  }
}

TEST(UTF8, AppendsAReplacementCharacterForAnInvalidCodePoint) {
  std::string text;
  for (const char32_t unit : {0xD800U, 0xDFFFU, 0x110000U})
    appendUTF8(text, unit);
  EXPECT_EQ(text, "\uFFFD\uFFFD\uFFFD");
}

TEST(DecodedText, IsReadFromUTF8AndUTF16WithAndWithoutAByteOrderMark) {
  const std::string little = "k\0\x21\x6B\x3D\xD8\xA8\xDD"s;
  const std::string big = "\0k\x6B\x21\xD8\x3D\xDD\xA8"s;
  for (const std::string& bytes :
       {"k次🖨"s, "\xEF\xBB\xBFk次🖨"s, little, big, "\xFF\xFE" + little, "\xFE\xFF" + big}) {
    EXPECT_EQ(decodedText(bytes), "k次🖨") << testing::PrintToString(bytes);
  }
  EXPECT_EQ(decodedText(""), "");
  for (const std::string& bytes : {"Gr\xF6\xDF"s, little + "x", "\xFE\xFF\xDD\xA8"s,
                                   "\xFE\xFF\xD8\x3D"s, "\xFE\xFF\xD8\x3D\0a"s}) {
    EXPECT_EQ(decodedText(bytes), std::nullopt) << testing::PrintToString(bytes);
  }
}

TEST(ASCII, ConvertsLettersAndHexDigitsOnly) {
  EXPECT_EQ(asciiLowercased("AZaz@[`{09\xC4"s), "azaz@[`{09\xC4");
  EXPECT_EQ(asciiUppercased("AZaz@[`{09\xE4"s), "AZAZ@[`{09\xE4");
  std::string digits;
  for (const char c : "/09:@AFG`afg\xE4"s)
    digits += std::to_string(hexDigitValue(c).value_or(99)) + ' ';
  EXPECT_EQ(digits, "99 0 9 99 99 10 15 99 99 10 15 99 99 ");
}

}  // namespace
}  // namespace onramp
