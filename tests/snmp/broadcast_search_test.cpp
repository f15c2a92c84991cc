// Runs as root of a network namespace of its own: see tests/in_namespace.

#include "snmp/broadcast_search.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <chrono>
#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <string>
#include <thread>
#include <utility>

#include "snmp/transport.h"

namespace onramp {
namespace {

using ::testing::UnorderedElementsAreArray;

Value result(const char* address, int activeInterface) {
  return Dictionary{
      {"ActiveIF", activeInterface}, {"Connection", "Network"}, {"IPaddress", address}};
}

// Dawdles over the first reply, so that all others of a flood have to wait in the socket.
snmp_status decodeSlowly(Dictionary& dictionary, const char* name, const snmp_varbind& binding,
                         std::uint64_t reserved) {
  static bool first = true;
  if (std::exchange(first, false)) std::this_thread::sleep_for(std::chrono::seconds(1));
  return decode_active_if(dictionary, name, binding, reserved);
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
  const mib_value_handler handler = {kActiveIFKey, decodeSlowly};
  mib_table table = {active_interface_table.entries, active_interface_table.count, &handler};
  const Array results = snmp_broadcast_search(table);
  EXPECT_EQ(snmp_request_counter, 2);

  // The flood's subnet: the first 256 replies, in order. Its name comes before the other's.
  ASSERT_GE(results.size(), 256U);
  const auto wire = results.begin() + 256;
  for (int number = 0; number < 256; ++number)
    EXPECT_EQ(results[static_cast<std::size_t>(number)], result("198.51.100.99", number));

  EXPECT_THAT(Array(wire, results.end()),
              UnorderedElementsAreArray({result("192.0.2.11", 1), result("192.0.2.12", 2),
                                         result("192.0.2.13", 7), result("192.0.2.13", 7),
                                         result("192.0.2.13", 7)}));
}

}  // namespace
}  // namespace onramp
