#include "netconfig/local_address_cache.h"

#include <cstddef>
#include <vector>

#include "platform/dynamic_store.h"
#include "platform/ipv4.h"

namespace onramp {

namespace {

local_address_list local_address_cache;

void refresh(local_address_list& cache) {
  cache = nullptr;
  KSSysConfigCopyCurrentLocalAddressList(&cache);
}

std::optional<IPv4Address> parsed(const std::string* text) {
  return text ? parseIPv4(*text) : std::nullopt;
}

}  // namespace

void AddNetworkInterfaceListChangeCallbackSCF() {
  KSSysConfigCopyCurrentLocalAddressList(&local_address_cache);

  const DynamicStoreRef store = createDynamicStore(
      "AddNetworkInterfaceListChangeCallbackSCF",
      [cache = &local_address_cache](const std::vector<std::string>&) { refresh(*cache); });
  if (const auto pattern = createNetworkInterfaceEntityKey(kSCDynamicStoreDomainState,
                                                           kSCCompAnyRegex, kSCEntNetIPv4)) {
    setNotificationKeys(store, {}, {*pattern});
  }
  // If the store could not be created, the source is null and adding it does nothing.
  addSourceToMainLoop(createRunLoopSource(store, 0));
}

local_address_list local_address_cache_copy() {
  return local_address_cache;
}

std::optional<std::string> local_address_for_destination(const std::string& address_text) {
  const std::optional<IPv4Address> destination = parseIPv4(address_text);
  if (!destination) return std::nullopt;

  const local_address_list list = local_address_cache;
  for (std::size_t i = 0; i < local_address_list_count(list); ++i) {
    const std::string* text = local_address_at(list, i);
    const std::optional<IPv4Address> local = parsed(text);
    const std::optional<IPv4Address> mask = parsed(local_subnet_mask_at(list, i));
    if (!local || !mask) return std::nullopt;
    if (((local->bits ^ destination->bits) & mask->bits) == 0) return *text;
  }
  return std::nullopt;
}

}  // namespace onramp
