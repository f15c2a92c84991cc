// Tests netconfig/ with a simulated dynamic store. kernel_test.cpp tests netconfig/ with the
// kernel's configuration.

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

/// A simulated dynamic store. A test sets its contents and can make it fail.
struct Store {
  Dictionary contents;
  std::string failing;  ///< the step that fails: "create", "key" or "copy"
  int error = 0;
  DynamicStoreCallback callback;  ///< the callback that was set last
  bool hasAddedNull = false;      ///< whether the source added last was null

  void change(Dictionary newContents) {
    contents = std::move(newContents);
    callback({});
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
  if (script().failing == "create") return nullptr;
  if (callback) script().callback = std::move(callback);
  return std::make_shared<DynamicStore>();
}

std::optional<std::string> createNetworkInterfaceEntityKey(std::string_view domain,
                                                           std::string_view interface,
                                                           std::string_view entity) {
  if (script().failing == "key") return std::nullopt;
  return std::string(domain) + std::string(interface) + "/" + std::string(entity);
}

std::optional<std::string> createNetworkGlobalEntityKey(std::string_view domain,
                                                        std::string_view entity) {
  return createNetworkInterfaceEntityKey(domain, "global", entity);
}

std::optional<Dictionary> copyMultiple(const DynamicStoreRef& store,
                                       const std::vector<std::string>&,
                                       const std::vector<std::string>&) {
  if (!store || script().failing == "copy") return std::nullopt;
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
  script().hasAddedNull = source == nullptr;
}

int lastDynamicStoreError() {
  return script().error;
}

namespace {

Dictionary state(const char* address, const char* mask) {
  return {{"Addresses", Array{address, "10.9.9.9"}}, {"SubnetMasks", Array{mask}}};
}

class Netconfig : public ::testing::Test {
 protected:
  void SetUp() override {
    store = Store{};
    AddNetworkInterfaceListChangeCallbackSCF();  // the callback stays until the process exits
  }

  Store& store = script();
};

TEST_F(Netconfig, ListHoldsTheAddressArraysOfEveryInterface) {
  const Dictionary home =
      state("192.0.2.1", "255.255.255.0").with("BroadcastAddresses", Array{"b"});
  const Dictionary odd = {{"SubnetMasks", Array{7}}, {"BroadcastAddresses", Array{}}};
  store.contents = {{"1", home.with("Router", "192.0.2.254")},
                    {"2", odd.with("Addresses", "no array")},
                    {"3", "no dictionary"}};
  local_address_list list;
  EXPECT_EQ(KSSysConfigCopyCurrentLocalAddressList(&list), 0);
  ASSERT_TRUE(list);
  ASSERT_EQ(*list, (Array{home, odd}));
  EXPECT_EQ(*local_address_at(list, 0), "192.0.2.1");
  EXPECT_EQ(*local_subnet_mask_at(list, 0), "255.255.255.0");
  EXPECT_EQ(*local_broadcast_address_at(list, 0), "b");
  for (const auto at : {local_address_at, local_subnet_mask_at, local_broadcast_address_at}) {
    EXPECT_FALSE(at(list, 1) || at(list, 2) || at(nullptr, 0));
  }

  const auto before = list;
  EXPECT_EQ(KSSysConfigCopyCurrentLocalAddressList(nullptr), 1);
  EXPECT_EQ(KSSysConfigCopyCurrentLocalAddressList(&list), 1) << "`list` holds a list already";
  EXPECT_EQ(list, before);
}

TEST_F(Netconfig, FailuresEmptyTheCacheAndOnlyTheListReportsThem) {
  store.contents = {{"State:global/IPv4", Dictionary{{"PrimaryInterface", "en0"}}}};
  EXPECT_EQ(KSSCCopyCurrentInterfaceName(), "en0");
  for (const char* const step : {"copy", "key", "create"}) {
    store.failing = step;
    EXPECT_EQ(KSSCCopyCurrentInterfaceName(), std::nullopt) << step;
    for (const auto& [error, status] : {std::pair{0, 1001}, {1004, 1004}}) {
      store.error = error;
      local_address_list list;
      EXPECT_EQ(KSSysConfigCopyCurrentLocalAddressList(&list), status) << step;
      EXPECT_FALSE(list);
    }
  }
  ASSERT_TRUE(local_address_cache_copy());
  store.change({});
  EXPECT_EQ(local_address_cache_copy(), nullptr);
  EXPECT_EQ(local_address_for_destination("192.168.1.20"), std::nullopt);
  store.failing = "create";
  AddNetworkInterfaceListChangeCallbackSCF();
  EXPECT_TRUE(store.hasAddedNull);
}

TEST_F(Netconfig, LocalAddressIsThatOfTheFirstInterfaceInTheDestinationsSubnet) {
  const Dictionary home = state("192.168.1.5", "255.255.255.0");
  const Dictionary wide = state("192.168.0.1", "255.255.0.0");
  const Dictionary maskless = {{"Addresses", Array{"192.168.7.1"}}};
  const Dictionary addressless = {{"SubnetMasks", Array{"255.255.255.0"}}};
  const Dictionary everything = state("172.16.0.1", "0.0.0.0");
  const std::tuple<std::vector<Dictionary>, const char*, std::optional<std::string>> cases[] = {
      {{home}, "192.168.2.20", std::nullopt},
      {{wide, home}, "192.168.1.20", "192.168.0.1"},
      {{home, wide}, "192.168.2.20", "192.168.0.1"},
      {{home, maskless}, "192.168.1.20", "192.168.1.5"},
      {{maskless, home}, "192.168.1.20", std::nullopt},
      {{addressless, home}, "192.168.1.20", std::nullopt},
      {{state("192.168.1.5", "wide open"), home}, "192.168.1.20", std::nullopt},
      {{everything}, "8.8.8.8", "172.16.0.1"},
      {{everything}, "printer.local", std::nullopt},
  };
  for (const auto& [entries, destination, local] : cases) {
    Dictionary contents;
    for (const Dictionary& entry : entries)
      contents = contents.with(std::to_string(contents.size()), entry);
    store.change(contents);
    EXPECT_EQ(local_address_for_destination(destination), local) << destination;
  }
}

TEST_F(Netconfig, NothingIsReturnedForAMissingAddressOrInterfaceName) {
  store.contents = {{"State:en1/IPv4", Dictionary{{"Addresses", Array{}}}},
                    {"State:en2/IPv4", "no dictionary"}};
  for (const char* name : {"en1", "en2"})
    EXPECT_EQ(KSSCcurrentAddressWithInterfaceName(name), std::nullopt) << name;
  EXPECT_EQ(KSSCCopyCurrentInterfaceName(), std::nullopt);
}

}  // namespace
}  // namespace onramp
