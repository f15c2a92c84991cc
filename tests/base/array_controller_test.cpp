#include "base/array_controller.h"

#include <gtest/gtest.h>

#include <optional>
#include <string>
#include <utility>
#include <vector>

namespace onramp {
namespace {

Dictionary entry(const std::string& name, const std::string& number = "") {
  return Dictionary{{"name", name}, {"number", number}};
}

// The names of all entries, the selected one in brackets.
std::string shown(const ArrayController& list) {
  std::string text;
  for (std::size_t i = 0; i < list.arrangedObjects().size(); ++i) {
    const Dictionary& dictionary = list.arrangedObjects()[i];
    const std::string name = *dictionary.string("name") + *dictionary.string("number");
    text += list.selectionIndex() == i ? '[' + name + ']' : name;
  }
  return text;
}

TEST(ArrayController, SelectsTheFirstEntryAddedToAnEmptyList) {
  ArrayController list;
  list.addObjects({});
  EXPECT_EQ(list.selectedObject(), std::nullopt);
  list.addObjects({entry("b"), entry("a")});
  list.addObjects({entry("c")});
  EXPECT_EQ(shown(list), "[b]ac");
  EXPECT_EQ(list.arrangedCount(), 3U);
  list.setSelectionIndex(3);
  list.addObjects({entry("d")});
  EXPECT_EQ(shown(list), "bacd") << "the selection was cleared on purpose";
  list.setSelectionIndex(0);
  list.removeAllObjects();
  EXPECT_EQ(list.arrangedCount(), 0U);
  EXPECT_EQ(list.selectionIndex(), std::nullopt);
  list.addObjects({entry("e")});
  EXPECT_EQ(shown(list), "[e]");
}

TEST(ArrayController, SelectsTheSuccessorOfARemovedSelection) {
  struct Case {
    std::optional<std::size_t> selected;
    const char* removed;
    const char* expected;
  };
  const Case cases[] = {{0, "a", "[b]cb"},       {2, "c", "ab[b]"},         {1, "b", "a[c]"},
                        {3, "b", "a[c]"},        {2, "a", "b[c]b"},         {0, "b", "[a]c"},
                        {1, "absent", "a[b]cb"}, {std::nullopt, "a", "bcb"}};
  for (const Case& c : cases) {
    ArrayController list;
    list.addObjects({entry("a"), entry("b"), entry("c"), entry("b")});
    list.setSelectionIndex(c.selected.value_or(4));
    list.removeObject(entry(c.removed));
    EXPECT_EQ(shown(list), c.expected) << "without " << c.removed;
  }
}

TEST(ArrayController, RearrangesByTheSortKeyAloneAndKeepsTheSelection) {
  ArrayController list;
  list.addObjects({entry("b", "1"), entry("a", "2"), entry("b", "3"), entry("a", "4")});
  list.setSelectedObject(entry("b", "3"));
  list.rearrange();
  EXPECT_EQ(shown(list), "b1a2[b3]a4") << "there is no sort key";
  list.setSortKey("name");
  list.rearrange();
  EXPECT_EQ(shown(list), "a2a4b1[b3]");
  list.addObjects({entry("B", "5")});
  EXPECT_EQ(shown(list), "a2a4b1[b3]B5");
  list.rearrange();
  EXPECT_EQ(shown(list), "B5a2a4b1[b3]");
  list.setSelectedObject(entry("absent"));
  list.rearrange();
  EXPECT_EQ(shown(list), "B5a2a4b1b3");
}

TEST(ArrayController, KeepsTheOrderOfEntriesThatSortAlike) {
  ArrayController list;
  list.setSortKey("name");
  std::string expected = "[";
  for (int i = 100; i < 200; ++i) {
    list.addObjects({entry("a", std::to_string(i))});
    expected += "a" + std::to_string(i) + (i == 100 ? "]" : "");
  }
  list.rearrange();
  EXPECT_EQ(shown(list), expected);
}

TEST(ArrayController, TellsTheTableWhatHasChanged) {
  ArrayController list;
  list.addObjects({entry("a"), entry("b")});
  std::string calls;
  list.bind([&] { calls += "change(" + shown(list) + ") "; },
            [&] { calls += "select(" + shown(list) + ") "; });
  list.setSelectionIndex(1);
  list.addObjects({});
  list.removeObject(entry("absent"));
  list.removeObject(entry("b"));
  EXPECT_EQ(calls, "change([a]b) select(a[b]) change([a]) ");
}

}  // namespace
}  // namespace onramp
