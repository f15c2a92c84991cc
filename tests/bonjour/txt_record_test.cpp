#include "bonjour/txt_record.h"

#include <gtest/gtest.h>

#include "tests/recording/network.h"

namespace onramp {

namespace {

using recording::txtData;

TEST(TxtRecord, ReadsAttributesAsTheyAreOnTheWire) {
  const auto record = TxtRecord::parse(
      txtData({"txtvers=1", "", "flag", "empty=", "=keyless", "Model=A=B", "model=second",
               std::string("raw=\0\xff", 6), "long=" + std::string(250, 'x'), "last=1"}));
  ASSERT_TRUE(record);
  EXPECT_EQ(record->value("txtvers"), "1");
  EXPECT_EQ(record->value("flag"), std::nullopt);
  EXPECT_EQ(record->value("empty"), "");
  EXPECT_EQ(record->value(""), std::nullopt);
  EXPECT_EQ(record->value("MODEL"), "A=B");
  EXPECT_EQ(record->value("raw"), std::string("\0\xff", 2));
  EXPECT_EQ(record->value("long"), std::string(250, 'x'));
  EXPECT_EQ(record->value("last"), "1");
  EXPECT_EQ(record->value("absent"), std::nullopt);
}

TEST(TxtRecord, DataThatEndsWithinAStringIsRefused) {
  const Data whole = txtData({"a=1", "b=22"});
  for (std::size_t size = 0; size <= whole.size(); ++size) {
    const bool betweenStrings = size == 0 || size == 4 || size == whole.size();
    EXPECT_EQ(TxtRecord::parse(std::span(whole).first(size)).has_value(), betweenStrings) << size;
  }
}

}  // namespace

}  // namespace onramp
