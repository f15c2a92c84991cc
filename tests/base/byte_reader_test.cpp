#include "base/byte_reader.h"

#include <gtest/gtest.h>

#include <limits>
#include <optional>
#include <string_view>

namespace onramp {
namespace {

using namespace std::literals;

TEST(ByteReader, ReadsInOrderUpToTheEnd) {
  ByteReader reader("\x80text\x00\x01\x02\xFF\xFF\xFF\xFF\xFF\xFF\xFF\xFE!"sv);
  EXPECT_EQ(reader.byte(), 0x80);
  EXPECT_EQ(reader.text(4), "text");
  EXPECT_EQ(reader.number(3), 0x102U);
  ByteReader ahead = reader;
  EXPECT_TRUE(ahead.skip(8));
  EXPECT_EQ(ahead.byte(), '!');
  EXPECT_TRUE(ahead.atEnd());
  EXPECT_EQ(reader.number(8), 0xFFFFFFFFFFFFFFFEU);
  EXPECT_EQ(reader.number(0), 0U);
  EXPECT_EQ(reader.remaining(), 1U);
}

TEST(ByteReader, StaysWhereItIsWhenAReadDoesNotFit) {
  constexpr auto kHuge = std::numeric_limits<std::uint64_t>::max();
  ByteReader reader("123456789"sv);
  EXPECT_FALSE(reader.number(9)) << "more than a number holds";
  EXPECT_TRUE(reader.narrow(3));
  for (const std::uint64_t count : {std::uint64_t{4}, kHuge}) {
    EXPECT_FALSE(reader.take(count));
    EXPECT_FALSE(reader.text(count));
    EXPECT_FALSE(reader.skip(count));
    EXPECT_FALSE(reader.narrow(count));
  }
  EXPECT_FALSE(reader.number(4));
  EXPECT_EQ(reader.text(3), "123");
  EXPECT_FALSE(reader.byte()) << "the input was narrowed";
}

}  // namespace
}  // namespace onramp
