#pragma once

#include <functional>
#include <memory>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "base/value.h"

/// The system's dynamic configuration store: the computer's present network, as dictionaries under
/// keys such as "State:/Network/Interface/en0/IPv4". Every operation stands for one of the
/// SystemConfiguration framework, which is one backend; the other fills the same keys from the
/// Linux kernel.
///
/// Of the store's contents two kinds of entry are promised, both in the state domain:
/// - an interface's IPv4 entity, for every interface that is up, can pass traffic (has its carrier,
///   is past authentication) and has an IPv4 address, the loopback interface included: the arrays
///   kSCPropNetIPv4Addresses and kSCPropNetIPv4SubnetMasks with one dotted text an address, in the
///   system's order, and kSCPropNetIPv4BroadcastAddresses with those that are set, absent when none
///   is;
/// - the global IPv4 entity, as long as there is a default route: the name of the interface that
///   the preferred one leads through as the text kSCDynamicStorePropNetPrimaryInterface.
namespace onramp {

inline constexpr std::string_view kSCDynamicStoreDomainState = "State:";
inline constexpr std::string_view kSCCompAnyRegex = "[^/]+";
inline constexpr std::string_view kSCEntNetIPv4 = "IPv4";
inline constexpr std::string_view kSCPropNetIPv4Addresses = "Addresses";
inline constexpr std::string_view kSCPropNetIPv4BroadcastAddresses = "BroadcastAddresses";
inline constexpr std::string_view kSCPropNetIPv4SubnetMasks = "SubnetMasks";
inline constexpr std::string_view kSCDynamicStorePropNetPrimaryInterface = "PrimaryInterface";

/// Error codes that both backends use; the framework has more.
inline constexpr int kSCStatusOK = 0;
inline constexpr int kSCStatusFailed = 1001;
inline constexpr int kSCStatusInvalidArgument = 1002;
inline constexpr int kSCStatusNoStoreSession = 2001;

/// A session with the store. Only the linked backend knows what it is; a null one is allowed
/// everywhere and fails with kSCStatusNoStoreSession. Used from one thread at a time, and from the
/// main one only when it has a callback.
struct DynamicStore;
using DynamicStoreRef = std::shared_ptr<DynamicStore>;

/// What delivers a session's change notifications once it is on the run loop. Keeps the session
/// alive.
struct DynamicStoreSource;
using DynamicStoreSourceRef = std::shared_ptr<DynamicStoreSource>;

using DynamicStoreCallback = std::function<void(const std::vector<std::string>& changedKeys)>;

/// A new session under `name`, which serves the system's diagnostics only. `callback` is called on
/// the main thread for the changes that setNotificationKeys asks for, once the session's source is
/// on the run loop. Null on failure.
[[nodiscard]] DynamicStoreRef createDynamicStore(const std::string& name,
                                                 DynamicStoreCallback callback = nullptr);

/// The key of an interface's entity: "State:/Network/Interface/en0/IPv4". With kSCCompAnyRegex for
/// the interface it is a pattern of those keys. Nothing on failure.
[[nodiscard]] std::optional<std::string> createNetworkInterfaceEntityKey(std::string_view domain,
                                                                         std::string_view interface,
                                                                         std::string_view entity);

/// The key of a global entity: "State:/Network/Global/IPv4". Nothing on failure.
[[nodiscard]] std::optional<std::string> createNetworkGlobalEntityKey(std::string_view domain,
                                                                      std::string_view entity);

/// The present values of all `keys`, and of all keys that match one of `patterns` (POSIX extended
/// regular expressions that have to match the whole key). Keys without a value are left out.
/// Nothing on failure.
[[nodiscard]] std::optional<Dictionary> copyMultiple(const DynamicStoreRef& store,
                                                     const std::vector<std::string>& keys,
                                                     const std::vector<std::string>& patterns);

/// From now on changes of these keys, named and matched as by copyMultiple, count as changes for
/// the session's callback; earlier requests are forgotten. A value that appears or disappears has
/// changed. False on failure.
bool setNotificationKeys(const DynamicStoreRef& store, const std::vector<std::string>& keys,
                         const std::vector<std::string>& patterns);

/// A source for the session's notifications; of several sources on one loop those with a lower
/// `order` come first where the loop knows an order. Null on failure.
[[nodiscard]] DynamicStoreSourceRef createRunLoopSource(const DynamicStoreRef& store, int order);

/// Adds `source` to the main run loop in the common modes (every mode, the modal one included).
/// The loop then keeps it until the process ends. A null source adds nothing.
void addSourceToMainLoop(const DynamicStoreSourceRef& source);

/// Why the calling thread's latest store operation failed; kSCStatusOK when nothing is known of a
/// failure.
[[nodiscard]] int lastDynamicStoreError();

}  // namespace onramp
