// Runs as root of a network namespace of its own: see tests/in_namespace.

#include "snmp/broadcast_search.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <cstdlib>

#include "snmp/transport.h"

namespace onramp {
namespace {

using ::testing::UnorderedElementsAreArray;

Value result(const char* address, int activeInterface) {
  return Dictionary{
      {"ActiveIF", activeInterface}, {"Connection", "Network"}, {"IPaddress", address}};
}

TEST(BroadcastSearch, AsksNobodyFromTheLoopbackInterface) {
  ASSERT_EQ(
      std::system(
          "ip link set lo up && ip addr flush dev lo && ip addr add 127.0.0.1/8 brd + dev lo"),
      0);
  EXPECT_EQ(snmp_broadcast_search(active_interface_table), Array{});
  EXPECT_EQ(snmp_request_counter, 0);
}

// One search for all that is asserted, because each subnet takes more than five seconds.
TEST(BroadcastSearch, KeepsEveryProperReplyOfEverySubnet) {
  ASSERT_EQ(std::system(SOURCE_FOLDER "/broadcast_network"), 0);
  const Array results = snmp_broadcast_search(active_interface_table);
  EXPECT_EQ(snmp_request_counter, 2);

  // The flood's subnet: the first 256 replies, in order. Its name comes before the other's.
  Array expected;
  for (int number = 0; number < 256; ++number)
    expected.push_back(result("198.51.100.99", number));
  ASSERT_GE(results.size(), expected.size());
  const auto wire = results.begin() + 256;
  EXPECT_EQ(Array(results.begin(), wire), expected);
  EXPECT_THAT(Array(wire, results.end()),
              UnorderedElementsAreArray({result("192.0.2.11", 1), result("192.0.2.12", 2),
                                         result("192.0.2.13", 7), result("192.0.2.13", 7),
                                         result("192.0.2.13", 7)}));
}

}  // namespace
}  // namespace onramp
