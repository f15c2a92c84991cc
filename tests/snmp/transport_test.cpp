#include "snmp/transport.h"

#include <gtest/gtest.h>

#include "snmp/get_set.h"
#include "tests/snmp/message.h"

namespace onramp {

namespace {

TEST(Addresses, AreNormalizedPartByPart) {
  const struct {
    const char* text;
    std::optional<std::string> normalized;
  } cases[] = {
      {"192.168.001.010", "192.168.1.10"},
      {"010.000.000.001", "10.0.0.1"},
      {"10.0.0.1", "10.0.0.1"},
      {"printer.local", "0.0"},
      {"fe80::1", "0"},
      {"1..2", "1.0.2"},
      {" 7x.-3", "7.-3"},
      {"1.2.3.4.5.6.7.8.9.1.2.3.4.5.6.7", "1.2.3.4.5.6.7.8.9.1.2.3.4.5.6.7"},
      {"1.2.3.4.5.6.7.8.9.1.2.3.4.5.6.17", std::nullopt},
      {"", std::nullopt},
      {nullptr, std::nullopt},
  };
  for (const auto& c : cases)
    EXPECT_EQ(snmp_normalize_ipv4(c.text), c.normalized) << (c.text ? c.text : "null");
}

TEST(Identifiers, CountFromZeroAndFromTwoHundredApart) {
  snmp_request_counter = 0;
  snmp_request_counter_ext = 200;
  Message m(1);
  m.varbinds[0].name = nullptr;  // so that nothing is sent
  for (const std::uint64_t expected : {0U, 1U}) {
    EXPECT_EQ(snmp_request_to_address(&m.message, "127.0.0.1"), SNMP_ERR_CODEC);
    EXPECT_EQ(m.message.request_id, expected);
    snmp_result_slot slot;
    EXPECT_EQ(snmp_get(m.message, {&slot, 1}, "127.0.0.1", kModeNoNetwork), SNMP_ERR_CODEC);
    EXPECT_EQ(m.message.request_id, 200 + 2 * expected);
    EXPECT_EQ(snmp_set(m.message, {&slot, 1}, "127.0.0.1", kModeNoNetwork), SNMP_ERR_CODEC);
    EXPECT_EQ(m.message.request_id, 201 + 2 * expected);
  }
  EXPECT_EQ(snmp_request_to_address(nullptr, "127.0.0.1"), SNMP_ERR_TRANSPORT);
  EXPECT_EQ(snmp_request_to_address(&m.message, ""), SNMP_ERR_TRANSPORT);
  EXPECT_EQ(snmp_next_request_id(), 2U) << "unused so far";
  snmp_request_counter = INT32_MAX;
  EXPECT_EQ(snmp_next_request_id(), std::uint64_t{INT32_MAX});
  EXPECT_EQ(static_cast<std::int64_t>(snmp_next_request_id()), INT32_MIN);
}

TEST(Exchange, WithoutANetworkIsAMalformedReply) {
  Message m(1);
  EXPECT_EQ(snmp_exchange(m.message, "127.0.0.1", kModeNoNetwork), SNMP_ERR_CODEC);
  EXPECT_EQ(m.message.varbind_count, 0U);
  EXPECT_EQ(std::string(m.message.community, m.message.community_length), "corridor");
}

TEST(Set, RefusesStringsAndIndexesBeyondTheStorage) {
  std::vector<std::uint8_t> text(1500, 'x');
  snmp_octets octets{1485, 1500, text.data()};
  snmp_result_slot slot{.type = kTagOctetString, .octets = &octets};
  Message m(2);
  m.varbinds[1].index = 1;
  EXPECT_EQ(snmp_set(m.message, {&slot, 1}, "127.0.0.1", kModeNoNetwork), SNMP_ERR_CODEC);
  m.varbinds[1].index = 0;
  EXPECT_EQ(snmp_set(m.message, {&slot, 1}, "127.0.0.1", kModeNoNetwork), SNMP_ERR_CODEC);
  EXPECT_EQ(m.varbinds[0].octets_value, nullptr);
  EXPECT_EQ(std::count(text.begin(), text.end(), 'x'), 1500);
}

TEST(Addresses, AreReadAndWrittenAsTheSystemDoes) {
  EXPECT_EQ(parseIPv4("10.0.0.1"), IPv4Address{0x0A000001});
  EXPECT_EQ(parseIPv4("010.0.0.1"), IPv4Address{0x08000001}) << "octal";
  EXPECT_EQ(parseIPv4("0.0"), IPv4Address{0});
  EXPECT_EQ(parseIPv4("256.0.0.1"), std::nullopt);
  EXPECT_EQ(dottedIPv4(IPv4Address{0xC0000201}), "192.0.2.1");
}

}  // namespace

}  // namespace onramp
