#include <gtest/gtest.h>

#include <optional>
#include <string>
#include <utility>
#include <vector>

#include "netconfig/current_interface.h"
#include "netconfig/local_address_cache.h"
#include "netconfig/local_address_list.h"
#include "platform/dynamic_store.h"

namespace onramp {
namespace {

enum class Step { kNone, kCreate, kKey, kCopy };

/// A store that holds and does what a test says.
struct Store {
  Dictionary contents;
  Step failing = Step::kNone;
  int error = 0;                  ///< what lastDynamicStoreError reports
  DynamicStoreCallback callback;  ///< of the session that was last created with one
  std::optional<bool> source;     ///< that was last added to the main loop: whether it was one

  /// The contents become these, and the installed callback hears of it.
  void change(Dictionary newContents) {
    contents = std::move(newContents);
    callback({"State:/Network/Interface/some/IPv4"});
  }
};

Store& script() {
  static Store store;
  return store;
}

}  // namespace

struct DynamicStore {};
struct DynamicStoreSource {};

DynamicStoreRef createDynamicStore(const std::string&, DynamicStoreCallback callback) {
  if (script().failing == Step::kCreate) return nullptr;
  if (callback) script().callback = std::move(callback);
  return std::make_shared<DynamicStore>();
}

std::optional<std::string> createNetworkInterfaceEntityKey(std::string_view domain,
                                                           std::string_view interface,
                                                           std::string_view entity) {
  if (script().failing == Step::kKey) return std::nullopt;
  return std::string(domain) + "interface:" + std::string(interface) + ":" + std::string(entity);
}

std::optional<std::string> createNetworkGlobalEntityKey(std::string_view domain,
                                                        std::string_view entity) {
  if (script().failing == Step::kKey) return std::nullopt;
  return std::string(domain) + "global:" + std::string(entity);
}

std::optional<Dictionary> copyMultiple(const DynamicStoreRef& store,
                                       const std::vector<std::string>&,
                                       const std::vector<std::string>&) {
  if (!store || script().failing == Step::kCopy) return std::nullopt;
  return script().contents;
}

bool setNotificationKeys(const DynamicStoreRef& store, const std::vector<std::string>&,
                         const std::vector<std::string>&) {
  return store != nullptr;
}

DynamicStoreSourceRef createRunLoopSource(const DynamicStoreRef& store, int) {
  return store ? std::make_shared<DynamicStoreSource>() : nullptr;
}

void addSourceToMainLoop(const DynamicStoreSourceRef& source) {
  script().source = source != nullptr;
}

int lastDynamicStoreError() {
  return script().error;
}

namespace {

Dictionary ipv4State(const Array& addresses, const Array& masks, const Array& broadcasts) {
  return {{"Addresses", addresses}, {"SubnetMasks", masks}, {"BroadcastAddresses", broadcasts}};
}

Dictionary ipv4State(const char* address, const char* mask) {
  return {{"Addresses", Array{address}}, {"SubnetMasks", Array{mask}}};
}

class Netconfig : public ::testing::Test {
 protected:
  void SetUp() override {
    store = Store{};
    // The callback stays installed for the process; a store that fails empties the cache.
    AddNetworkInterfaceListChangeCallbackSCF();
    store.failing = Step::kCopy;
    store.callback({});
    store.failing = Step::kNone;
  }

  Store& store = script();
};

TEST_F(Netconfig, ListHoldsTheAddressArraysOfEveryStateThatIsADictionary) {
  store.contents = {
      {"a", ipv4State(Array{"192.0.2.1", "192.0.2.2"}, Array{"255.255.255.0"}, Array{})
                .with("Router", "192.0.2.254")},
      {"b", Dictionary{{"Addresses", "192.0.2.3"}, {"SubnetMasks", Array{"255.0.0.0"}}}},
      {"c", Array{"no dictionary"}},
      {"d", Dictionary{}}};
  local_address_list list;
  EXPECT_EQ(KSSysConfigCopyCurrentLocalAddressList(&list), 0);
  ASSERT_TRUE(list);
  EXPECT_EQ(*list,
            (Array{ipv4State(Array{"192.0.2.1", "192.0.2.2"}, Array{"255.255.255.0"}, Array{}),
                   Dictionary{{"SubnetMasks", Array{"255.0.0.0"}}}, Dictionary{}}));
}

TEST_F(Netconfig, ComputerWithoutIPv4HasAnEmptyList) {
  local_address_list list;
  EXPECT_EQ(KSSysConfigCopyCurrentLocalAddressList(&list), 0);
  ASSERT_TRUE(list);
  EXPECT_EQ(local_address_list_count(list), 0U);
}

TEST_F(Netconfig, ListFailsWithTheStoresErrorOr1001) {
  for (const Step step : {Step::kCreate, Step::kKey, Step::kCopy}) {
    for (const auto& [error, status] : {std::pair{0, 1001}, {1004, 1004}}) {
      store.failing = step;
      store.error = error;
      local_address_list list;
      EXPECT_EQ(KSSysConfigCopyCurrentLocalAddressList(&list), status);
      EXPECT_FALSE(list);
    }
  }
}

TEST_F(Netconfig, ListGoesIntoANullPlaceOnly) {
  EXPECT_EQ(KSSysConfigCopyCurrentLocalAddressList(nullptr), 1);
  local_address_list list = std::make_shared<const Array>(Array{1});
  EXPECT_EQ(KSSysConfigCopyCurrentLocalAddressList(&list), 1);
  EXPECT_EQ(*list, Array{1});
}

TEST_F(Netconfig, AccessorsGiveTheFirstTextOfAnEntry) {
  const auto list = std::make_shared<const Array>(
      Array{ipv4State(Array{"10.0.0.1", "10.0.0.2"}, Array{"255.0.0.0"}, Array{"10.255.255.255"}),
            ipv4State(Array{}, Array{7}, Array{"10.1.1.1"}), Dictionary{}, "no dictionary"});
  EXPECT_EQ(local_address_list_count(list), 4U);
  EXPECT_EQ(*local_address_at(list, 0), "10.0.0.1");
  EXPECT_EQ(*local_subnet_mask_at(list, 0), "255.0.0.0");
  EXPECT_EQ(*local_broadcast_address_at(list, 0), "10.255.255.255");
  EXPECT_EQ(*local_broadcast_address_at(list, 1), "10.1.1.1");
  EXPECT_EQ(local_subnet_mask_at(list, 1), nullptr);
  for (std::size_t index = 1; index < 6; ++index)
    EXPECT_EQ(local_address_at(list, index), nullptr) << index;
  EXPECT_EQ(local_address_list_count(nullptr), 0U);
  EXPECT_EQ(local_address_at(nullptr, 0), nullptr);
}

TEST_F(Netconfig, DestinationIsReachedFromTheFirstInterfaceInItsSubnet) {
  const Dictionary home = ipv4State("192.168.1.5", "255.255.255.0");
  const Dictionary wide = ipv4State("192.168.0.1", "255.255.0.0");
  const Dictionary maskless = {{"Addresses", Array{"192.168.7.1"}}};
  const Dictionary addressless = {{"SubnetMasks", Array{"255.255.255.0"}}};
  const Dictionary unreadable = ipv4State("192.168.1.5", "wide open");
  const Dictionary everything = ipv4State("172.16.0.1", "0.0.0.0");
  const struct {
    std::vector<Dictionary> entries;
    const char* destination;
    std::optional<std::string> local;
  } cases[] = {
      {{home}, "192.168.1.20", "192.168.1.5"},
      {{home}, "192.168.2.20", std::nullopt},
      {{home, wide}, "192.168.1.20", "192.168.1.5"},
      {{wide, home}, "192.168.1.20", "192.168.0.1"},
      {{home, wide}, "192.168.2.20", "192.168.0.1"},
      {{everything, home}, "192.168.1.20", "172.16.0.1"},
      {{home, maskless}, "192.168.1.20", "192.168.1.5"},
      {{maskless, home}, "192.168.1.20", std::nullopt},
      {{addressless, home}, "192.168.1.20", std::nullopt},
      {{unreadable, home}, "192.168.1.20", std::nullopt},
      {{everything}, "printer.local", std::nullopt},
      {{everything}, "", std::nullopt},
      {{}, "192.168.1.20", std::nullopt},
  };
  for (const auto& [entries, destination, local] : cases) {
    Dictionary contents;
    for (const Dictionary& entry : entries) {
      contents = contents.with("interface " + std::to_string(contents.size()), entry);
    }
    store.change(contents);
    EXPECT_EQ(local_address_for_destination(destination), local) << destination;
  }
}

TEST_F(Netconfig, NothingIsReachedWithoutACache) {
  store.contents = {{"a", ipv4State("192.168.1.5", "255.255.255.0")}};
  EXPECT_EQ(local_address_for_destination("192.168.1.20"), std::nullopt);
}

TEST_F(Netconfig, CacheIsFilledAndFollowsEveryChange) {
  store.contents = {{"a", ipv4State("192.0.2.1", "255.255.255.0")}};
  AddNetworkInterfaceListChangeCallbackSCF();
  const local_address_list before = local_address_cache_copy();
  store.change({{"a", ipv4State("192.0.2.9", "255.255.255.0")}});
  EXPECT_EQ(*local_address_at(local_address_cache_copy(), 0), "192.0.2.9");
  EXPECT_EQ(*local_address_at(before, 0), "192.0.2.1");

  store.failing = Step::kCopy;
  store.change({});
  EXPECT_EQ(local_address_cache_copy(), nullptr);
}

TEST_F(Netconfig, SourceIsAddedEvenWhenItIsNull) {
  for (const auto& [step, isSource] : {std::pair{Step::kCreate, false}, {Step::kKey, true}}) {
    store.failing = step;
    store.source.reset();
    AddNetworkInterfaceListChangeCallbackSCF();
    EXPECT_EQ(store.source, isSource);
  }
}

TEST_F(Netconfig, InterfacesAreAskedForByKey) {
  store.contents = {
      {"State:interface:en0:IPv4", ipv4State(Array{"192.0.2.1", "192.0.2.2"}, Array{}, Array{})},
      {"State:interface:en1:IPv4", ipv4State(Array{}, Array{}, Array{})},
      {"State:interface:en2:IPv4", "no dictionary"},
      {"State:global:IPv4", Dictionary{{"PrimaryInterface", "en0"}}}};
  EXPECT_EQ(KSSCcurrentAddressWithInterfaceName("en0"), "192.0.2.1");
  EXPECT_EQ(KSSCCopyCurrentInterfaceName(), "en0");
  for (const char* name : {"en1", "en2", "en3"}) {
    EXPECT_EQ(KSSCcurrentAddressWithInterfaceName(name), std::nullopt) << name;
  }

  store.contents = {{"State:global:IPv4", Dictionary{{"PrimaryInterface", 0}}}};
  EXPECT_EQ(KSSCCopyCurrentInterfaceName(), std::nullopt);
  for (const Step step : {Step::kCreate, Step::kKey, Step::kCopy}) {
    store.failing = step;
    EXPECT_EQ(KSSCcurrentAddressWithInterfaceName("en0"), std::nullopt);
    EXPECT_EQ(KSSCCopyCurrentInterfaceName(), std::nullopt);
  }
}

}  // namespace
}  // namespace onramp
