#include "base/array_controller.h"

#include <gtest/gtest.h>

#include <optional>
#include <string>
#include <thread>
#include <utility>
#include <vector>

namespace onramp {
namespace {

Dictionary entry(const std::string& name, const std::string& number = "") {
  return Dictionary{{"name", name}, {"number", number}};
}

// Returns each entry's name and number, with the selected entry in brackets.
std::string shown(const ArrayController& list) {
  std::string text;
  for (std::size_t i = 0; i < list.arrangedObjects().size(); ++i) {
    const Dictionary& dictionary = list.arrangedObjects()[i];
    const std::string name = *dictionary.string("name") + *dictionary.string("number");
    text += list.selectionIndex() == i ? '[' + name + ']' : name;
  }
  return text;
}

TEST(ArrayController, SelectsTheFirstEntryAddedToAnEmptyListAndNotifiesTheTable) {
  ArrayController list;
  std::string calls;
  list.bind([&] { calls += shown(list) + "; "; },
            [&] { calls += "selected " + shown(list) + "; "; });
  list.addObjects({});
  list.addObjects({entry("b"), entry("a")});
  list.addObjects({entry("c")});
  list.setSelectionIndex(3);
  list.addObjects({entry("d")});
  list.setSelectionIndex(0);
  list.removeObject(entry("absent"));
  list.removeAllObjects();
  list.addObjects({entry("e")});
  EXPECT_EQ(calls, "; [b]a; [b]ac; selected bac; bacd; selected [b]acd; ; [e]; ");
  EXPECT_EQ(list.arrangedCount(), 1U);
}

TEST(ArrayController, SelectsTheNextOrLastEntryWhenTheSelectedOneIsRemoved) {
  const std::tuple<std::size_t, const char*, const char*> cases[] = {
      {0, "a", "[b]cb"}, {2, "c", "ab[b]"}, {1, "b", "a[c]"},        {3, "b", "a[c]"},
      {2, "a", "b[c]b"}, {0, "b", "[a]c"},  {1, "absent", "a[b]cb"}, {4, "a", "bcb"}};
  for (const auto& [selected, removed, expected] : cases) {
    ArrayController list;
    list.addObjects({entry("a"), entry("b"), entry("c"), entry("b")});
    list.setSelectionIndex(selected);
    list.removeObject(entry(removed));
    EXPECT_EQ(shown(list), expected) << "without " << removed;
  }
}

TEST(ArrayController, SortsStablyByTheSortKeyAndKeepsTheSelection) {
  ArrayController list;
  std::string sorted;
  for (int i = 100; i < 200; ++i) {
    list.addObjects({entry("b", std::to_string(i))});
    sorted += i == 150 ? "[b150]" : "b" + std::to_string(i);
  }
  list.setSelectedObject(entry("b", "150"));
  list.addObjects({entry("a"), entry("B")});
  list.rearrange();
  EXPECT_EQ(shown(list), sorted + "aB") << "without a sort key, the order does not change";
  list.setSortKey("name");
  list.rearrange();
  EXPECT_EQ(shown(list), "Ba" + sorted);
  list.setSelectedObject(entry("absent"));
  list.rearrange();
  EXPECT_EQ(list.selectionIndex(), std::nullopt);
}

// Under the thread sanitizer, this test fails if arrangedCount() is not safe to call on another
// thread.
TEST(ArrayController, LetsAnotherThreadWaitForAnEntry) {
  ArrayController list;
  std::size_t seen = 0;
  std::thread reader([&] {
    while (seen == 0)
      seen = list.arrangedCount();
  });
  list.addObjects({entry("a")});
  reader.join();
  EXPECT_EQ(seen, 1U);
}

}  // namespace
}  // namespace onramp
