#include "base/text.h"

#include <gtest/gtest.h>

#include <string>
#include <utility>

#include "base/ascii.h"

namespace onramp {
namespace {

using namespace std::literals;

// The characters of `bytes`, each byte that begins none as "?", written again.
std::string readAndWritten(std::string_view bytes) {
  std::string text;
  while (!bytes.empty()) {
    const auto character = takeUTF8(bytes);
    if (character) {
      appendUTF8(text, *character);
    } else {
      text += '?';
    }
  }
  return text;
}

TEST(UTF8, IsReadByTheCharacterAndRefusedByTheByte) {
  for (const char* const whole :
       {"", "a\x7F", "\u0080\u07FF", "\u0800\uD7FF\uE000\uFFFF", "\U00010000\U0010FFFF"}) {
    EXPECT_EQ(readAndWritten(whole), whole);
    EXPECT_TRUE(isUTF8(whole)) << whole;
  }
  const std::pair<std::string_view, const char*> broken[] = {
      {"\x80z", "?z"},                 // a tail without a lead
      {"\xC1\xBFz", "??z"},            // overlong
      {"\xE0\x9F\xBFz", "???z"},       // overlong
      {"\xF0\x8F\xBF\xBFz", "????z"},  // overlong
      {"\xED\xA0\x80z", "???z"},       // a surrogate
      {"\xF4\x90\x80\x80z", "????z"},  // above U+10FFFF
      {"\xF5\x80\x80\x80z", "????z"},
      {"\xE3\x81z", "??z"},  // too short
      {"\xE3\x81\x82"sv.substr(0, 2), "??"}};
  for (const auto& [bytes, expected] : broken) {
    EXPECT_EQ(readAndWritten(bytes), expected);
    EXPECT_FALSE(isUTF8(bytes)) << expected;
  }
}

TEST(UTF8, HoldsNoSurrogates) {
  for (const char32_t unit : {0xD800U, 0xDBFFU, 0xDC00U, 0xDFFFU, 0x110000U}) {
    std::string text;
    appendUTF8(text, unit);
    EXPECT_EQ(text, "\uFFFD") << std::uint32_t{unit};
  }
  EXPECT_EQ(joinedSurrogates(0xD800, 0xDC00), 0x10000U);
  EXPECT_EQ(joinedSurrogates(0xDBFF, 0xDFFF), 0x10FFFFU);
}

TEST(DecodedText, ComesFromBothEncodingsWithAndWithoutAMark) {
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

TEST(ASCII, KnowsLettersAndDigitsOnly) {
  EXPECT_EQ(asciiLowercased("AZaz@[`{09\xC4"s), "azaz@[`{09\xC4");
  EXPECT_EQ(asciiUppercased("AZaz@[`{09\xE4"s), "AZAZ@[`{09\xE4");
  EXPECT_EQ(hexDigitValue('9'), 9U);
  EXPECT_EQ(hexDigitValue('a'), 10U);
  EXPECT_EQ(hexDigitValue('F'), 15U);
  for (const char other : {'/', ':', '@', 'G', '`', 'g', '\xE4'})
    EXPECT_EQ(hexDigitValue(other), std::nullopt) << other;
}

}  // namespace
}  // namespace onramp
