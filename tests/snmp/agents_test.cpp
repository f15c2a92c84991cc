// Exchanges with the agents of agents.py, which runs this program, over real sockets.

#include <gtest/gtest.h>

#include <chrono>
#include <filesystem>

#include "snmp/query.h"

namespace onramp {

namespace {

using std::chrono::milliseconds;
using std::chrono::steady_clock;

constexpr int kRefused = -1;
constexpr int kNoReply = -2;

// The device's ActiveIF.
std::int64_t ask(const char* address) {
  bool noReply = false;
  const auto result = snmp_query_table(&active_interface_table, address, noReply, nullptr, nullptr);
  return result ? result->integerValue(kActiveIFKey) : noReply ? kNoReply : kRefused;
}

template <typename Work>
steady_clock::duration timeOf(Work work) {
  const auto start = steady_clock::now();
  work();
  return steady_clock::now() - start;
}

TEST(Agents, AreAskedByTheirRealProtocol) {
  EXPECT_EQ(ask("127.0.1.1"), 2);
  EXPECT_EQ(ask("127.0.1.2"), 1);
  EXPECT_EQ(ask("127.0.1.3"), kRefused) << "the object is missing";
  EXPECT_EQ(ask("127.0.1.4"), kRefused) << "a string for an integer";
}

TEST(Agents, AreHeardAndNobodyElseForTwoSeconds) {
  EXPECT_EQ(ask("127.0.2.1"), 2) << "strangers answer first, and otherwise";
  EXPECT_EQ(ask("127.0.1.7"), 2) << "after 1 s";
  EXPECT_EQ(ask("127.0.1.8"), kNoReply) << "after 2.5 s";
  EXPECT_EQ(ask("127.0.1.2"), 1) << "the late answer does no harm";
  EXPECT_GE(timeOf([] { EXPECT_EQ(ask("127.0.1.6"), kNoReply); }), milliseconds(2000));
}

// A closed port costs three pauses of 20 ms, and no wait of two seconds.
TEST(Agents, ThatAreNotThereAreKnownAtOnceAndLeaveNoDescriptorOpen) {
  using std::filesystem::directory_iterator;
  const auto open = [] {
    return std::distance(directory_iterator("/proc/self/fd"), directory_iterator());
  };
  const auto before = open();
  bool wireless = true;
  const auto took = timeOf([&] { wireless = snmp_active_interface_is_wireless({"127.0.1.99"}); });
  EXPECT_FALSE(wireless);
  EXPECT_GE(took, milliseconds(60));
  EXPECT_LT(took, milliseconds(6000));
  EXPECT_TRUE(snmp_active_interface_is_wireless({"127.0.1.99", "127.0.1.1"}));
  EXPECT_EQ(open(), before);
}

}  // namespace

}  // namespace onramp
