#include "platform/freedesktop/strings_table.h"

#include <gtest/gtest.h>

#include "platform/property_list.h"
#include "tests/recording/temporary_folder.h"

namespace onramp {
namespace {

TEST(StringsTable, FollowsTheGrammarOfOldStylePropertyLists) {
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

TEST(StringsTable, IsReadFromTextAndFromXMLAndBinaryLists) {
  const Dictionary expected{{"k", "次"}};
  const TemporaryFolder folder;
  ASSERT_TRUE(writeDictionaryAtomically(expected, folder / "xml"));
  EXPECT_EQ(loadStringsTable(folder / "xml"), expected);
  const std::pair<const char*, std::string> files[] = {
      {"UTF-8", "\"k\" = \"次\";"},
      {"binary", std::string("bplist00\xD1\1\2\x51k\x61\x6B\x21\x08\x0B\x0D\0\0\0\0\0\0\1\1"
                             "\0\0\0\0\0\0\0\3\0\0\0\0\0\0\0\0\0\0\0\0\0\0\0\x10",
                             16 + 3 + 32)}};
  for (const auto& [name, bytes] : files)
    EXPECT_EQ(loadStringsTable(folder.holding("table", bytes)), expected) << name;

  for (const std::string& bytes :
       {std::string("\"k\" = \"Gr\xF6\xDF\";"), std::string(17 << 20, ' ')})
    EXPECT_EQ(loadStringsTable(folder.holding("table", bytes)), std::nullopt);
}

}  // namespace
}  // namespace onramp
