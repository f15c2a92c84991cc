#include "base/key_value.h"

#include <gtest/gtest.h>

namespace onramp {
namespace {

TEST(KeyValueTexts, ReachWhatIsBoundBeforeAndAfter) {
  KeyValueTexts texts;
  std::string log;
  const auto bind = [&](const std::string& name, const char* key) {
    texts.bind(key, [&log, name](const std::string& text) { log += name + '=' + text + ' '; });
  };
  EXPECT_EQ(texts.valueForKey("title"), "");
  bind("early", "title");
  EXPECT_EQ(log, "") << "there is no text yet";
  texts.setValueForKey("A", "title");
  bind("late", "title");
  bind("other", "message");
  texts.setValueForKey("B", "title");
  EXPECT_EQ(log, "early=A late=A early=B late=B ");
  EXPECT_EQ(texts.valueForKey("title"), "B");
}

}  // namespace
}  // namespace onramp
