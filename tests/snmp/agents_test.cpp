// Queries the agents of agents.py over real sockets. agents.py starts the agents and then this
// program.

#include <gtest/gtest.h>

#include <chrono>
#include <filesystem>

#include "snmp/query.h"

namespace onramp {

namespace {

using std::chrono::milliseconds;
using std::chrono::steady_clock;

// Returns the value of ActiveIF from the agent at `address`, or nothing when the agent does not
// answer in time.
std::optional<std::int64_t> ask(const char* address) {
  bool noReply = false;
  const auto result = snmp_query_table(&active_interface_table, address, noReply, nullptr, nullptr);
  return result ? std::optional(result->integerValue(kActiveIFKey)) : std::nullopt;
}

TEST(Agents, AreHeardForTwoSecondsAndOtherSendersAreIgnored) {
  EXPECT_EQ(ask("127.0.2.1"), 2) << "other senders answer 1 before the agent answers 2";
  const auto start = steady_clock::now();
  EXPECT_EQ(ask("127.0.1.8"), std::nullopt) << "the agent answers after 4 s";
  EXPECT_GE(steady_clock::now() - start, milliseconds(2000));
}

// A closed port costs three pauses of 20 ms, and no waits of two seconds.
TEST(ClosedPorts, AreNoticedAtOnceAndLeaveNoDescriptorOpen) {
  using std::filesystem::directory_iterator;
  const auto open = [] {
    return std::distance(directory_iterator("/proc/self/fd"), directory_iterator());
  };
  const auto before = open();
  const auto start = steady_clock::now();
  EXPECT_FALSE(snmp_active_interface_is_wireless({"127.0.1.99"}));
  const auto took = steady_clock::now() - start;
  EXPECT_GE(took, milliseconds(60));
  EXPECT_LT(took, milliseconds(12000));
  EXPECT_TRUE(snmp_active_interface_is_wireless({"127.0.1.99", "127.0.1.1"}));
  EXPECT_EQ(open(), before);
}

}  // namespace

}  // namespace onramp
