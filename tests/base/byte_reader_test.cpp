#include "base/byte_reader.h"

#include <gtest/gtest.h>

namespace onramp {
namespace {

using namespace std::literals;

TEST(ByteReader, ReadsInOrderAndStaysWhereItIsWhenAReadDoesNotFit) {
  ByteReader reader("\x80text\x00\x01\x02\xFF\xFF\xFF\xFF\xFF\xFF\xFF\xFE!"sv);
  EXPECT_EQ(reader.byte(), 0x80);
  EXPECT_EQ(reader.text(4), "text");
  EXPECT_EQ(reader.number(3), 0x102U);
  EXPECT_FALSE(reader.number(9)) << "more than a number holds";
  EXPECT_EQ(reader.number(8), 0xFFFFFFFFFFFFFFFEU);
  for (const std::uint64_t count : {std::uint64_t{2}, UINT64_MAX}) {
    EXPECT_FALSE(reader.text(count) || reader.skip(count)) << count;
  }
  EXPECT_FALSE(reader.number(2));
  EXPECT_EQ(reader.byte(), '!');
  EXPECT_FALSE(reader.byte());
}

}  // namespace
}  // namespace onramp
