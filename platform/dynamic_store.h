#pragma once

#include <functional>
#include <memory>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "base/value.h"

/// Access to the system's dynamic configuration store. The store describes the current state of the
/// computer's network as dictionaries under keys such as "State:/Network/Interface/en0/IPv4". The
/// last part of a key is called the entity. Each function here except addSourceToMainLoop()
/// corresponds to a function of the SystemConfiguration framework of macOS. The backend for macOS
/// uses that framework. The backend for Linux obtains the entries described below from the kernel.
///
/// Callers can rely on two kinds of entries, both in the domain kSCDynamicStoreDomainState:
/// - The IPv4 entity of an interface. It exists for every interface that is up, is ready for
///   traffic (connected and, where required, authenticated) and has an IPv4 address. This includes
///   the loopback interface. The arrays kSCPropNetIPv4Addresses and kSCPropNetIPv4SubnetMasks hold
///   one string in dotted form for each address, in the system's order. The array
///   kSCPropNetIPv4BroadcastAddresses holds the broadcast addresses that are set, and is absent
///   when none is set.
/// - The global IPv4 entity. It exists while there is a usable default route. Its string
///   kSCDynamicStorePropNetPrimaryInterface names the interface of the preferred default route.
namespace onramp {

inline constexpr std::string_view kSCDynamicStoreDomainState = "State:";
inline constexpr std::string_view kSCCompAnyRegex = "[^/]+";
inline constexpr std::string_view kSCEntNetIPv4 = "IPv4";
inline constexpr std::string_view kSCPropNetIPv4Addresses = "Addresses";
inline constexpr std::string_view kSCPropNetIPv4BroadcastAddresses = "BroadcastAddresses";
inline constexpr std::string_view kSCPropNetIPv4SubnetMasks = "SubnetMasks";
inline constexpr std::string_view kSCDynamicStorePropNetPrimaryInterface = "PrimaryInterface";

/// The error codes that both backends use. The backend for macOS also uses the framework's other
/// codes.
inline constexpr int kSCStatusOK = 0;
inline constexpr int kSCStatusFailed = 1001;
inline constexpr int kSCStatusInvalidArgument = 1002;
inline constexpr int kSCStatusNoStoreSession = 2001;

/// A session with the store. The linked backend defines this type. A function that is called with a
/// null session fails with kSCStatusNoStoreSession, except that on macOS, copyMultiple() then uses
/// a temporary session. Only one thread at a time may use a session, and only the main thread may
/// use a session that has a callback.
struct DynamicStore;
using DynamicStoreRef = std::shared_ptr<DynamicStore>;

/// Delivers a session's change notifications once addSourceToMainLoop() has added this source to
/// the main run loop. A source keeps its session alive.
struct DynamicStoreSource;
using DynamicStoreSourceRef = std::shared_ptr<DynamicStoreSource>;

using DynamicStoreCallback = std::function<void(const std::vector<std::string>& changedKeys)>;

/// Creates a session. The system uses `name` only for diagnostics. `callback` is called on the main
/// thread with those keys selected by setNotificationKeys() whose values have changed. The calls
/// begin when the session's source has been added to the main run loop. Returns null on failure.
[[nodiscard]] DynamicStoreRef createDynamicStore(const std::string& name,
                                                 DynamicStoreCallback callback = nullptr);

/// Returns the key of an interface's entity, such as "State:/Network/Interface/en0/IPv4". If
/// `interface` is kSCCompAnyRegex, the result is a pattern that matches the keys of all interfaces.
/// Returns nothing on failure.
[[nodiscard]] std::optional<std::string> createNetworkInterfaceEntityKey(std::string_view domain,
                                                                         std::string_view interface,
                                                                         std::string_view entity);

/// Returns the key of a global entity, such as "State:/Network/Global/IPv4". Returns nothing on
/// failure.
[[nodiscard]] std::optional<std::string> createNetworkGlobalEntityKey(std::string_view domain,
                                                                      std::string_view entity);

/// Returns the current values of all `keys` and of all keys that match one of `patterns`, each
/// under its key. The patterns are POSIX extended regular expressions that must match the whole
/// key. Leaves out keys without a value. Returns nothing on failure.
[[nodiscard]] std::optional<Dictionary> copyMultiple(const DynamicStoreRef& store,
                                                     const std::vector<std::string>& keys,
                                                     const std::vector<std::string>& patterns);

/// Makes the session call its callback when the value of a selected key changes. `keys` and
/// `patterns` select keys as in copyMultiple(). Replaces the selection of any earlier call. A value
/// that appears or disappears also counts as changed. Returns false on failure.
bool setNotificationKeys(const DynamicStoreRef& store, const std::vector<std::string>& keys,
                         const std::vector<std::string>& patterns);

/// Creates a source for the session's notifications. If the run loop orders its sources, it handles
/// a source with a lower `order` first. Returns null on failure.
[[nodiscard]] DynamicStoreSourceRef createRunLoopSource(const DynamicStoreRef& store, int order);

/// Adds `source` to the main run loop. The source works even while a modal window is shown. The
/// loop keeps the source until the process exits. Does nothing when `source` is null or when a
/// source of the same session has already been added. If the thread for it cannot be created, the
/// session's callback is not called until setNotificationKeys() is called again and succeeds.
void addSourceToMainLoop(const DynamicStoreSourceRef& source);

/// Returns the error code of the last function in this header that failed on the calling thread, or
/// kSCStatusOK when no failure is known.
[[nodiscard]] int lastDynamicStoreError();

}  // namespace onramp
