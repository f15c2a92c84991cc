#include <gtest/gtest.h>

#include <algorithm>
#include <optional>
#include <regex>
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

bool matches(const std::vector<std::string>& patterns, const std::string& key) {
  return std::any_of(patterns.begin(), patterns.end(), [&](const std::string& pattern) {
    return std::regex_match(key, std::regex(pattern, std::regex::extended));
  });
}

std::string keyOf(const std::string& interface) {
  return "State:/Network/Interface/" + interface + "/IPv4";
}

/// A store that holds and does what a test says.
struct Store {
  Dictionary contents;
  Step failing = Step::kNone;
  int error = 0;                  ///< what lastDynamicStoreError reports
  std::string session;            ///< name of the last one
  DynamicStoreCallback callback;  ///< of the last session that has one
  std::vector<std::string> notified;
  std::optional<int> source;  ///< order of the last one added to the main loop; -1 when it was null

  void change(const std::string& key, Dictionary newContents) {
    contents = std::move(newContents);
    if (matches(notified, key)) callback({key});
  }
};

Store& script() {
  static Store store;
  return store;
}

}  // namespace

struct DynamicStore {};
struct DynamicStoreSource {
  int order;
};

DynamicStoreRef createDynamicStore(const std::string& name, DynamicStoreCallback callback) {
  script().session = name;
  if (script().failing == Step::kCreate) return nullptr;
  if (callback) script().callback = std::move(callback);
  return std::make_shared<DynamicStore>();
}

std::optional<std::string> createNetworkInterfaceEntityKey(std::string_view domain,
                                                           std::string_view interface,
                                                           std::string_view entity) {
  if (script().failing == Step::kKey) return std::nullopt;
  EXPECT_EQ(std::string(domain) + std::string(entity), "State:IPv4");
  return keyOf(std::string(interface));
}

std::optional<std::string> createNetworkGlobalEntityKey(std::string_view domain,
                                                        std::string_view entity) {
  if (script().failing == Step::kKey) return std::nullopt;
  return std::string(domain) + "/Network/Global/" + std::string(entity);
}

std::optional<Dictionary> copyMultiple(const DynamicStoreRef& store,
                                       const std::vector<std::string>&,
                                       const std::vector<std::string>& patterns) {
  if (!store || script().failing == Step::kCopy) return std::nullopt;
  std::vector<Dictionary::Pair> found;
  for (const auto& [key, value] : script().contents) {
    if (matches(patterns, key)) found.emplace_back(key, value);
  }
  return Dictionary(std::move(found));
}

bool setNotificationKeys(const DynamicStoreRef& store, const std::vector<std::string>&,
                         const std::vector<std::string>& patterns) {
  script().notified = patterns;
  return store != nullptr;
}

DynamicStoreSourceRef createRunLoopSource(const DynamicStoreRef& store, int order) {
  return store ? std::make_shared<DynamicStoreSource>(DynamicStoreSource{order}) : nullptr;
}

void addSourceToMainLoop(const DynamicStoreSourceRef& source) {
  script().source = source ? source->order : -1;
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
    // The callback stays installed for the process; a store that fails empties the cache.
    AddNetworkInterfaceListChangeCallbackSCF();
    store.failing = Step::kCopy;
    store.change(keyOf("en0"), {});
    store.failing = Step::kNone;
  }

  Store& store = script();
};

TEST_F(Netconfig, ListHoldsTheAddressArraysOfEveryInterface) {
  local_address_list none;
  EXPECT_EQ(KSSysConfigCopyCurrentLocalAddressList(&none), 0);
  ASSERT_TRUE(none) << "a computer without IPv4 has an empty list";
  EXPECT_EQ(local_address_list_count(none), 0U);

  const Dictionary home =
      state("192.0.2.1", "255.255.255.0").with("BroadcastAddresses", Array{"b"});
  const Dictionary odd = {{"SubnetMasks", Array{7}}, {"BroadcastAddresses", Array{}}};
  store.contents = {{keyOf("en0"), home.with("Router", "192.0.2.254")},
                    {keyOf("en1"), odd.with("Addresses", "no array")},
                    {keyOf("en2"), "no dictionary"},
                    {"State:/Network/Global/IPv4", home}};
  local_address_list list;
  EXPECT_EQ(KSSysConfigCopyCurrentLocalAddressList(&list), 0);
  EXPECT_EQ(store.session, "KSSysConfigCopyCurrentLocalAddressList");
  ASSERT_TRUE(list);
  ASSERT_EQ(*list, (Array{home, odd}));
  EXPECT_EQ(local_address_list_count(list), 2U);
  EXPECT_EQ(*local_address_at(list, 0), "192.0.2.1");
  EXPECT_EQ(*local_subnet_mask_at(list, 0), "255.255.255.0");
  EXPECT_EQ(*local_broadcast_address_at(list, 0), "b");
  for (const auto at : {local_address_at, local_subnet_mask_at, local_broadcast_address_at}) {
    for (const std::size_t index : {1U, 2U, 3U})
      EXPECT_EQ(at(list, index), nullptr) << index;
    EXPECT_EQ(at(nullptr, 0), nullptr);
  }
  EXPECT_EQ(local_address_list_count(nullptr), 0U);
}

TEST_F(Netconfig, ListFailsWithTheStoresErrorOr1001AndGoesIntoANullPlaceOnly) {
  for (const Step step : {Step::kCreate, Step::kKey, Step::kCopy}) {
    for (const auto& [error, status] : {std::pair{0, 1001}, {1004, 1004}}) {
      store.failing = step;
      store.error = error;
      local_address_list list;
      EXPECT_EQ(KSSysConfigCopyCurrentLocalAddressList(&list), status);
      EXPECT_FALSE(list);
    }
  }
  EXPECT_EQ(KSSysConfigCopyCurrentLocalAddressList(nullptr), 1);
  const auto before = std::make_shared<const Array>();
  local_address_list list = before;
  EXPECT_EQ(KSSysConfigCopyCurrentLocalAddressList(&list), 1);
  EXPECT_EQ(list, before);
}

TEST_F(Netconfig, DestinationIsReachedFromTheFirstInterfaceInItsSubnet) {
  const Dictionary home = state("192.168.1.5", "255.255.255.0");
  const Dictionary wide = state("192.168.0.1", "255.255.0.0");
  const Dictionary maskless = {{"Addresses", Array{"192.168.7.1"}}};
  const Dictionary addressless = {{"SubnetMasks", Array{"255.255.255.0"}}};
  const Dictionary everything = state("172.16.0.1", "0.0.0.0");
  const struct {
    std::vector<Dictionary> entries;
    const char* destination;
    std::optional<std::string> local;
  } cases[] = {
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
  EXPECT_EQ(local_address_for_destination("192.168.1.20"), std::nullopt) << "no cache";
  for (const auto& [entries, destination, local] : cases) {
    Dictionary contents;
    for (const Dictionary& entry : entries)
      contents = contents.with(keyOf("en" + std::to_string(contents.size())), entry);
    store.change(keyOf("en0"), contents);
    EXPECT_EQ(local_address_for_destination(destination), local) << destination;
  }
}

TEST_F(Netconfig, CacheIsFilledAndFollowsEveryChange) {
  store.contents = {{keyOf("en0"), state("192.0.2.1", "255.255.255.0")}};
  AddNetworkInterfaceListChangeCallbackSCF();
  EXPECT_EQ(store.session, "AddNetworkInterfaceListChangeCallbackSCF");
  EXPECT_EQ(store.source, 0);
  const local_address_list before = local_address_cache_copy();
  ASSERT_TRUE(before);
  store.change(keyOf("en7"), {{keyOf("en7"), state("192.0.2.9", "255.255.255.0")}});
  ASSERT_TRUE(local_address_cache_copy());
  EXPECT_EQ(*local_address_at(local_address_cache_copy(), 0), "192.0.2.9");
  EXPECT_EQ(*local_address_at(before, 0), "192.0.2.1") << "the old list is unchanged";

  store.failing = Step::kCopy;
  store.change(keyOf("en7"), {});
  EXPECT_EQ(local_address_cache_copy(), nullptr);
  store.failing = Step::kCreate;
  AddNetworkInterfaceListChangeCallbackSCF();
  EXPECT_EQ(store.source, -1) << "the source is added even when it is null";
}

// The kernel's test sees which are returned.
TEST_F(Netconfig, InterfacesWithoutATextAreNotReturned) {
  const std::string global = "State:/Network/Global/IPv4";
  store.contents = {{keyOf("en1"), Dictionary{{"Addresses", Array{}}}},
                    {keyOf("en2"), "no dictionary"},
                    {global, Dictionary{{"PrimaryInterface", 0}}}};
  for (const char* name : {"en1", "en2", "en3"})
    EXPECT_EQ(KSSCcurrentAddressWithInterfaceName(name), std::nullopt) << name;
  EXPECT_EQ(store.session, "KSSCcurrentAddressWithInterfaceName");
  EXPECT_EQ(KSSCCopyCurrentInterfaceName(), std::nullopt);
  EXPECT_EQ(store.session, "KSSCCopyCurrentInterfaceName");
  store.contents = {{global, Dictionary{{"PrimaryInterface", "en0"}}}};
  EXPECT_EQ(KSSCCopyCurrentInterfaceName(), "en0");
  for (const Step step : {Step::kCreate, Step::kKey, Step::kCopy}) {
    store.failing = step;
    EXPECT_EQ(KSSCCopyCurrentInterfaceName(), std::nullopt);
  }
}

}  // namespace
}  // namespace onramp
