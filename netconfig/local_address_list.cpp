#include "netconfig/local_address_list.h"

#include <optional>
#include <utility>

#include "platform/dynamic_store.h"

namespace onramp {

namespace {

int storeError() {
  const int error = lastDynamicStoreError();
  return error == kSCStatusOK ? kSCStatusFailed : error;
}

Dictionary addressArrays(const Dictionary& state) {
  std::vector<Dictionary::Pair> arrays;
  for (const std::string_view key :
       {kSCPropNetIPv4Addresses, kSCPropNetIPv4BroadcastAddresses, kSCPropNetIPv4SubnetMasks}) {
    if (const Array* array = state.array(key)) arrays.emplace_back(key, *array);
  }
  return Dictionary(std::move(arrays));
}

}  // namespace

int KSSysConfigCopyCurrentLocalAddressList(local_address_list* out_list) {
  if (out_list == nullptr || *out_list != nullptr) return kLocalAddressListMisused;

  const DynamicStoreRef store = createDynamicStore("KSSysConfigCopyCurrentLocalAddressList");
  if (!store) return storeError();
  const std::optional<std::string> pattern =
      createNetworkInterfaceEntityKey(kSCDynamicStoreDomainState, kSCCompAnyRegex, kSCEntNetIPv4);
  if (!pattern) return storeError();
  const std::optional<Dictionary> states = copyMultiple(store, {}, {*pattern});
  if (!states) return storeError();

  Array list;
  for (const auto& [key, value] : *states) {
    if (const auto* state = value.as<Dictionary>()) list.emplace_back(addressArrays(*state));
  }
  *out_list = std::make_shared<const Array>(std::move(list));
  return 0;
}

std::size_t local_address_list_count(const local_address_list& list) {
  return list ? list->size() : 0;
}

const std::string* local_address_list_value(const local_address_list& list, std::size_t index,
                                            std::string_view key) {
  if (index >= local_address_list_count(list)) return nullptr;
  const auto* entry = (*list)[index].as<Dictionary>();
  const Array* texts = entry ? entry->array(key) : nullptr;
  if (!texts || texts->empty()) return nullptr;
  return texts->front().as<std::string>();
}

const std::string* local_address_at(const local_address_list& list, std::size_t index) {
  return local_address_list_value(list, index, kSCPropNetIPv4Addresses);
}

const std::string* local_subnet_mask_at(const local_address_list& list, std::size_t index) {
  return local_address_list_value(list, index, kSCPropNetIPv4SubnetMasks);
}

const std::string* local_broadcast_address_at(const local_address_list& list, std::size_t index) {
  return local_address_list_value(list, index, kSCPropNetIPv4BroadcastAddresses);
}

}  // namespace onramp
