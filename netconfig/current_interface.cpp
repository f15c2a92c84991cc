#include "netconfig/current_interface.h"

#include "platform/dynamic_store.h"

namespace onramp {

namespace {

// Returns the dictionary that the dynamic store has under `key`. Returns nothing when `key` is
// nothing, when the store has no such dictionary, and when the store cannot be read. The store
// reads `key` as a regular expression, so a key with a character such as "+" finds nothing.
std::optional<Dictionary> stateUnder(const std::string& storeName,
                                     const std::optional<std::string>& key) {
  if (!key) return std::nullopt;
  const std::optional<Dictionary> states = copyMultiple(createDynamicStore(storeName), {}, {*key});
  return states ? states->dictionary(*key) : std::nullopt;
}

}  // namespace

std::optional<std::string> KSSCcurrentAddressWithInterfaceName(const std::string& interface_name) {
  const std::optional<Dictionary> state = stateUnder(
      "KSSCcurrentAddressWithInterfaceName",
      createNetworkInterfaceEntityKey(kSCDynamicStoreDomainState, interface_name, kSCEntNetIPv4));
  const Array* addresses = state ? state->array(kSCPropNetIPv4Addresses) : nullptr;
  if (!addresses || addresses->empty()) return std::nullopt;
  const auto* first = addresses->front().as<std::string>();
  return first ? std::optional(*first) : std::nullopt;
}

std::optional<std::string> KSSCCopyCurrentInterfaceName() {
  const std::optional<Dictionary> state =
      stateUnder("KSSCCopyCurrentInterfaceName",
                 createNetworkGlobalEntityKey(kSCDynamicStoreDomainState, kSCEntNetIPv4));
  return state ? state->string(kSCDynamicStorePropNetPrimaryInterface) : std::nullopt;
}

}  // namespace onramp
