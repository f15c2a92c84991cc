#include "platform/freedesktop/strings_table.h"

#include <gtest/gtest.h>

#include "platform/property_list.h"
#include "tests/recording/temporary_folder.h"

namespace onramp {
namespace {

TEST(StringsTable, FollowsTheGrammarOfOldStyleLists) {
  const std::pair<const char*, Dictionary> cases[] = {
      {"", {}},
      {" \n// nothing\n/* at ** all */", {}},
      {R"("a" = "b";)", {{"a", "b"}}},
      {"// old line ends\r\"a\" = \"b\";\r", {{"a", "b"}}},
      {R"(/* first */ "a"="b"; // second
          "c" /* in */ = /* between */ "d" ;)",
       {{"a", "b"}, {"c", "d"}}},
      {R"({ "a" = "b"; "c" = "d" })", {{"a", "b"}, {"c", "d"}}},
      {R"(BTN_NEXT = Weiter; key.x-1/$: = 'say "so"';)",
       {{"BTN_NEXT", "Weiter"}, {"key.x-1/$:", "say \"so\""}}},
      {R"("alone"; b;)", {{"alone", "alone"}, {"b", "b"}}},
      {R"("a" = "first"; "a" = "last";)", {{"a", "last"}}},
      {R"("q" = "\"\\\'\/"; "l" = "one\ntwo\tthree\r";)",
       {{"q", "\"\\'/"}, {"l", "one\ntwo\tthree\r"}}},
      {R"("u" = "\U0041\U00e9\U732B\UD83D\UDDA8!"; "short" = "\U41;";)",
       {{"u", "Aé猫🖨!"}, {"short", "A;"}}},
      {R"("lone" = "\UD83D-\UDDA8";)", {{"lone", "\uFFFD-\uFFFD"}}},
      {R"("o" = "\101\12\0601"; "upper" = "\341\365\200";)",
       {{"o", "A\n01"}, {"upper", "Æı\u00A0"}}},
      {"\"two\nlines\" = \"as\\\nwritten\";", {{"two\nlines", "as\nwritten"}}},
      {R"("%@ of %1$@" = "%1$@ の %@"; "鍵" = "値";)",
       {{"%@ of %1$@", "%1$@ の %@"}, {"鍵", "値"}}}};
  for (const auto& [text, expected] : cases)
    EXPECT_EQ(parseStrings(text), expected) << text;
}

TEST(StringsTable, IsNothingWhenItBreaksTheGrammarAnywhere) {
  for (const char* const text :
       {"\"a\" = \"b\"", "\"a\" = \"b\"; \"c", "\"a\" \"b\";", "\"a\" = ;", "= \"b\";", "/* open",
        "\"a\" = \"b\\", "{ \"a\" = \"b\";", "\"a\" = \"b\"; }", "\"a\" = ( \"b\" );",
        "a = 'it''s';", "größe = \"b\";"}) {
    EXPECT_EQ(parseStrings(text), std::nullopt) << text;
  }
}

std::string utf16(const std::u16string& text, bool bigEndian) {
  std::string bytes;
  for (const char16_t unit : text) {
    const auto high = static_cast<char>(unit >> 8);
    const auto low = static_cast<char>(unit & 0xFF);
    bytes += bigEndian ? std::string{high, low} : std::string{low, high};
  }
  return bytes;
}

TEST(StringsTable, IsReadInEveryFormThatMediaHold) {
  const std::u16string text = u"\"k\" = \"次へ 🖨\";";
  const Dictionary expected{{"k", "次へ 🖨"}};
  const TemporaryFolder folder;
  ASSERT_TRUE(writeDictionaryAtomically(expected, folder / "xml"));
  const std::pair<const char*, std::string> files[] = {
      {"UTF-8", "\"k\" = \"次へ 🖨\";"},
      {"UTF-8 with a mark", "\xEF\xBB\xBF\"k\" = \"次へ 🖨\";"},
      {"UTF-16, little-endian", "\xFF\xFE" + utf16(text, false)},
      {"UTF-16, big-endian", "\xFE\xFF" + utf16(text, true)},
      {"UTF-16, little-endian, without a mark", utf16(text, false)},
      {"UTF-16, big-endian, without a mark", utf16(text, true)},
      {"binary", std::string("bplist00\xD1\1\2\x51k\x65\x6B\x21\x30\x78\0\x20\xD8\x3D\xDD\xA8"
                             "\x08\x0B\x0D\0\0\0\0\0\0\1\1\0\0\0\0\0\0\0\3\0\0\0\0\0\0\0\0"
                             "\0\0\0\0\0\0\0\x18",
                             24 + 3 + 32)}};
  for (const auto& [name, bytes] : files)
    EXPECT_EQ(loadStringsTable(folder.holding("table", bytes)), expected) << name;
  EXPECT_EQ(loadStringsTable(folder / "xml"), expected);

  for (const std::string& bytes :
       {std::string("\"k\" = \"Gr\xF6\xDF"
                    "e\";"),
        utf16(text, false) + "x", "\xFE\xFF" + utf16(u"\"k\" = \"\xD800\";", true),
        "<plist>" + utf16(text, false), std::string(17 << 20, ' ')}) {
    EXPECT_EQ(loadStringsTable(folder.holding("table", bytes)), std::nullopt)
        << bytes.substr(0, 40);
  }
}

}  // namespace
}  // namespace onramp
