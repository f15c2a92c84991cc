#include <gtest/gtest.h>

#include "snmp/ber_reader.h"
#include "snmp/ber_writer.h"
#include "tests/snmp/message.h"

namespace onramp {

namespace {

template <typename Put>
std::vector<std::uint8_t> written(Put put, std::size_t room = 1000) {
  std::vector<std::uint8_t> bytes(room);
  ber_writer out(bytes);
  if (put(out) != SNMP_OK) return {};
  bytes.resize(room - out.remaining());
  return bytes;
}

TEST(Integers, TakeTheFewestBytesAndAreSignExtendedByTheirNumber) {
  const struct {
    std::int64_t value;
    const char* bytes;
    std::int64_t read;
    std::uint64_t asUnsigned;  // what is left of the value in its place, too
  } cases[] = {
      {0, "02 01 00", 0, 0},
      {127, "02 01 7F", 127, 127},
      {128, "02 02 00 80", 128, 128},
      {0x7FFF, "02 02 7F FF", 0x7FFF, 0x7FFF},
      {0x8000, "02 03 00 80 00", 0x8000, 0x8000},
      {0x7FFFFF, "02 03 7F FF FF", 0x7FFFFF, 0x7FFFFF},
      {0x800000, "02 04 00 80 00 00", 0x800000, 0x800000},
      {INT32_MAX, "02 04 7F FF FF FF", INT32_MAX, INT32_MAX},
      {-1, "02 01 FF", -1, 0xFF},
      {-128, "02 01 80", -128, 0x80},
      {-129, "02 02 FF 7F", -129, 0xFF7F},
      {-32768, "02 02 80 00", -32768, 0x8000},
      {-32769, "02 03 FF 7F FF", 0xFFFF7FFF, 0xFF7FFF},
      {-0x800000, "02 03 80 00 00", 0xFF800000, 0x800000},
      {-0x800001, "02 04 FF 7F FF FF", 0xFF7FFFFF, 0xFF7FFFFF},
      {INT32_MIN, "02 04 80 00 00 00", 0x80000000, 0x80000000},
  };
  for (const auto& c : cases) {
    std::int64_t value = c.value;
    const auto bytes = hex(c.bytes);
    EXPECT_EQ(written([&](ber_writer& out) { return ber_put_int(out, value, 2); }), bytes);
    EXPECT_EQ(static_cast<std::uint64_t>(value), c.asUnsigned);
    ber_reader in{std::span<const std::uint8_t>(bytes).subspan(2)};
    ber_reader again = in;
    std::uint64_t asUnsigned = 0;
    EXPECT_EQ(ber_get_int(in, value, bytes[1]), SNMP_OK);
    EXPECT_EQ(ber_get_uint(again, asUnsigned, bytes[1]), SNMP_OK);
    EXPECT_EQ(value, c.read);
    EXPECT_EQ(asUnsigned, c.asUnsigned);
    EXPECT_EQ(in.remaining() + again.remaining(), 0U);
  }
}

TEST(Integers, UnsignedOnesWithTheTopBitSetTakeALeadingZero) {
  EXPECT_EQ(written([](ber_writer& out) { return ber_put_uint(out, 0x7FFFFFFF, 0x41); }),
            hex("41 04 7F FF FF FF"));
  EXPECT_EQ(written([](ber_writer& out) { return ber_put_uint(out, 0x80000000, 0x42); }),
            hex("42 05 00 80 00 00 00"));
}

TEST(Lengths, HaveThreeFormsAndNoOther) {
  for (const std::uint16_t length : std::vector<std::uint16_t>{0, 127, 128, 255, 256, 65535}) {
    const auto bytes = written([&](ber_writer& out) { return ber_put_length(out, length); });
    EXPECT_EQ(bytes.size(), length < 128 ? 1U : length < 256 ? 2U : 3U);
    ber_reader in(bytes);
    std::uint16_t read = 1;
    EXPECT_EQ(ber_get_length(in, read), SNMP_OK);
    EXPECT_EQ(read, length);
  }
  for (const char* const refused :
       {"", "80", "81", "82 01", "83 00 00 01", "84 DE AD BA BE", "FF"}) {
    const auto bytes = hex(refused);
    ber_reader in(bytes);
    std::uint16_t length = 0;
    EXPECT_EQ(ber_get_length(in, length), SNMP_ERR_CODEC) << refused;
    EXPECT_EQ(in.remaining(), bytes.size()) << "the cursor stays";
  }
}

TEST(ObjectIdentifiers, TakeOneByteForTheirFirstTwoArcs) {
  std::uint16_t arcs[] = {6, 15};
  EXPECT_EQ(ber_oid_size({2, 2, arcs}), 1U);
  EXPECT_EQ(ber_oid_size({1, 2, arcs}), 0U) << "there have to be two";
  arcs[1] = 16;
  EXPECT_EQ(ber_oid_size({2, 2, arcs}), 0U) << "6 x 40 + 16 is no byte";

  const auto bytes = hex("2B");
  ber_reader in(bytes);
  snmp_oid withoutRoom{1, 1, arcs};
  EXPECT_EQ(ber_get_oid(in, &withoutRoom, 1), SNMP_ERR_CODEC);
  EXPECT_EQ(arcs[1], 16) << "nothing is written behind it";
}

TEST(ObjectIdentifiers, HaveAtMost255BytesOfContent) {
  std::vector<std::uint16_t> arcs(257, 1);
  EXPECT_EQ(ber_oid_size({256, 256, arcs.data()}), 255U);
  EXPECT_EQ(ber_oid_size({257, 257, arcs.data()}), 0U);
}

TEST(ObjectIdentifiers, CompareByArcsAndThenByWhetherTheFirstEndsEarlier) {
  std::uint16_t a[] = {1, 3, 6};
  std::uint16_t b[] = {1, 3, 7};
  EXPECT_EQ(snmp_oid_compare({3, 3, a}, {3, 3, b}), -1);
  EXPECT_EQ(snmp_oid_compare({3, 3, b}, {3, 3, a}), 1);
  EXPECT_EQ(snmp_oid_compare({2, 2, a}, {3, 3, b}), -1);
  EXPECT_EQ(snmp_oid_compare({3, 3, a}, {2, 2, b}), 0);
  EXPECT_EQ(snmp_oid_compare({3, 3, a}, {3, 3, a}), 0);
}

TEST(Strings, NeedAPlaceOrAreReferredToWithinTheInput) {
  const auto bytes = hex("61 62 63");
  snmp_octets target{9, 2, nullptr};
  ber_reader in(bytes);
  EXPECT_EQ(ber_get_octets(in, nullptr, 2), SNMP_ERR_CODEC) << "there is no place for it";
  EXPECT_EQ(ber_get_octets_ref(in, &target, 4), SNMP_ERR_CODEC);
  EXPECT_EQ(ber_get_octets_ref(in, &target, 2), SNMP_OK);
  EXPECT_EQ(target.bytes, bytes.data());
  EXPECT_EQ(target.capacity, 0) << "nothing may be written to the input";
}

}  // namespace

}  // namespace onramp
