// Checks that netconfig/ and the dynamic store report the kernel's network configuration. Runs as
// root in a new network namespace; see tests/in_namespace.

#include <gmock/gmock.h>

#include <algorithm>
#include <cstdlib>
#include <string>
#include <vector>

#include "netconfig/current_interface.h"
#include "netconfig/local_address_cache.h"
#include "netconfig/local_address_list.h"
#include "platform/dynamic_store.h"
#include "tests/recording/loop.h"

namespace onramp {
namespace {

using ::testing::UnorderedElementsAreArray;

constexpr double kMostSeconds = 20;

void ip(const std::string& arguments) {
  ASSERT_EQ(std::system(("ip " + arguments).c_str()), 0) << arguments;
}

std::vector<std::string> entriesOf(const local_address_list& list) {
  std::vector<std::string> texts;
  for (const Value& value : list ? *list : Array{}) {
    std::string text;
    for (const char* key : {"Addresses", "SubnetMasks", "BroadcastAddresses"}) {
      const Array* array = value.as<Dictionary>()->array(key);
      for (const Value& address : array ? *array : Array{})
        text += *address.as<std::string>() + ",";
      text += "|";
    }
    texts.push_back(text);
  }
  return texts;
}

class Kernel : public ::testing::Test {
 protected:
  // Makes two pairs of connected interfaces: near and far, and left and right. All are up and in
  // this namespace.
  void SetUp() override {
    recording::resetLoop();
    ip("link set lo up");
    ip("link add near type veth peer name far");
    ip("link add left type veth peer name right");
    for (const char* name : {"near", "far", "left", "right"})
      ip(std::string("link set up ") + name);
  }

  void TearDown() override {
    ip("link del far");
    ip("link del right");
    ip("route flush table all");
    ip("link set lo down");
  }
};

const char* const kLoopback = "127.0.0.1,|255.0.0.0,||";

// Each scenario has a name, the commands that set it up, the expected entries of all interfaces but
// loopback, and the expected primary interface, which is empty if there is none.
const std::tuple<const char*, std::vector<const char*>, std::vector<std::string>, const char*>
    kScenarios[] = {
        {"addresses of several kinds, and a route that is no default route",
         {"addr add 192.0.2.1/24 brd + dev near", "addr add 192.0.2.7/24 brd + dev near",
          "addr add 10.0.0.1/8 brd 10.9.9.9 dev left", "addr add 10.1.0.1 peer 10.1.0.2 dev left",
          "addr add 10.1.0.1 peer 10.1.0.3 dev left", "addr add 203.0.113.4/31 dev right",
          "addr add 203.0.113.9/0 dev right", "route add 0.0.0.0/1 via 192.0.2.254"},
         {"192.0.2.1,192.0.2.7,|255.255.255.0,255.255.255.0,|192.0.2.255,192.0.2.255,|",
          "10.0.0.1,10.1.0.1,10.1.0.1,|255.0.0.0,255.255.255.255,255.255.255.255,|10.9.9.9,|",
          "203.0.113.4,203.0.113.9,|255.255.255.254,0.0.0.0,||"},
         ""},
        {"a name with a dot, and an interface without carrier",
         {"link set near down", "link set near name near.7", "link set near.7 up",
          "addr add 192.0.2.1/24 brd + dev near.7", "route add default via 192.0.2.254",
          "addr add 198.51.100.1/24 dev left", "link set right down"},
         {"192.0.2.1,|255.255.255.0,|192.0.2.255,|"},
         "near.7"},
        {"the first usable default route with the lowest metric wins",
         {"addr add 192.0.2.1/24 dev near", "addr add 198.51.100.1/24 dev left",
          "route add unreachable default metric 5", "route add default via 192.0.2.254 metric 600",
          "route append default via 198.51.100.254 metric 9",
          "route append default via 192.0.2.254 metric 9",
          "route add default via 192.0.2.254 table 9"},
         {"192.0.2.1,|255.255.255.0,||", "198.51.100.1,|255.255.255.0,||"},
         "left"},
        {"a default route over two interfaces, the first of them down",
         {"addr add 192.0.2.1/24 dev near", "addr add 198.51.100.1/24 dev left",
          "route add default nexthop via 192.0.2.254 nexthop via 198.51.100.254",
          "link set near down"},
         {"198.51.100.1,|255.255.255.0,||"},
         "left"},
        {"a default route over two interfaces",
         {"addr add 192.0.2.1/24 dev near", "addr add 198.51.100.1/24 dev left",
          "route add default nexthop via 192.0.2.254 nexthop via 198.51.100.254"},
         {"192.0.2.1,|255.255.255.0,||", "198.51.100.1,|255.255.255.0,||"},
         "near"},
};

TEST_F(Kernel, ListsTheAddressesAndThePrimaryInterface) {
  for (auto [name, commands, expected, primary] : kScenarios) {
    SCOPED_TRACE(name);
    for (const char* command : commands)
      ip(command);
    expected.emplace_back(kLoopback);
    local_address_list list;
    EXPECT_EQ(KSSysConfigCopyCurrentLocalAddressList(&list), 0);
    EXPECT_THAT(entriesOf(list), UnorderedElementsAreArray(expected));
    EXPECT_EQ(KSSCCopyCurrentInterfaceName().value_or(""), primary);
    TearDown();
    SetUp();
  }
  ip("addr add 192.0.2.1/24 dev near");
  EXPECT_EQ(KSSCcurrentAddressWithInterfaceName("near"), "192.0.2.1");
  EXPECT_EQ(KSSCcurrentAddressWithInterfaceName("left"), std::nullopt);
  ip("link set lo down");
  ip("link set near down");
  local_address_list none;
  EXPECT_EQ(KSSysConfigCopyCurrentLocalAddressList(&none), 0);
  EXPECT_THAT(none, ::testing::Pointee(Array{}));
}

// Only one test may install the cache's callback, which stays until the process exits.
TEST_F(Kernel, CacheFollowsAddressesThatComeAndGo) {
  AddNetworkInterfaceListChangeCallbackSCF();
  std::vector<std::string> expected = {kLoopback};
  const auto follows = [&] {
    const auto agrees = [&] {
      std::vector<std::string> cached = entriesOf(local_address_cache_copy());
      return std::is_permutation(cached.begin(), cached.end(), expected.begin(), expected.end());
    };
    recording::runPosted(agrees, std::chrono::duration<double>(kMostSeconds));
    EXPECT_THAT(entriesOf(local_address_cache_copy()), UnorderedElementsAreArray(expected));
  };
  ip("addr add 192.0.2.1/24 dev near");
  expected.emplace_back("192.0.2.1,|255.255.255.0,||");
  follows();
  EXPECT_EQ(local_address_for_destination("192.0.2.77"), "192.0.2.1");
  ip("link set far down");
  expected.pop_back();
  follows();
  EXPECT_EQ(local_address_for_destination("192.0.2.77"), std::nullopt);
}

TEST_F(Kernel, CallbackIsCalledWhenTheDefaultRouteChanges) {
  std::vector<std::string> heard;
  const DynamicStoreRef store = createDynamicStore("test", [&](const auto& keys) { heard = keys; });
  const std::string global = "State:/Network/Global/IPv4";
  ASSERT_TRUE(setNotificationKeys(store, {global}, {}));
  addSourceToMainLoop(createRunLoopSource(store, 0));
  const auto hears = [&] {
    heard.clear();
    recording::runPosted([&] { return !heard.empty(); },
                         std::chrono::duration<double>(kMostSeconds));
    EXPECT_EQ(heard, std::vector{global});
  };

  ip("addr add 192.0.2.1/24 dev near");
  ip("addr add 198.51.100.1/24 dev left");
  ip("route add default via 192.0.2.254 metric 20");
  hears();
  ip("route add default via 198.51.100.254 metric 10");
  hears();
}

}  // namespace
}  // namespace onramp
