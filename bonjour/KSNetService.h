#pragma once

#include <optional>
#include <string>
#include <vector>

#include "platform/net_service.h"

namespace onramp {

// The classes in bonjour/ are built on these operations on network services. A function that
// returns an int returns 0 on success and 1 on failure. A function that reads a service returns
// nothing or false if the service is null. All functions must be called on the main thread.

/// Callbacks for browsing and resolving. They are called when a service is found, is gone or has
/// been resolved. Each pointer may be null. `flags` are the flags in platform/net_service.h. The
/// structure must outlive every search and resolve that is started with it.
struct ServiceClientCallbacks {
  void (*add)(const NetServiceRef& service, unsigned long flags) = nullptr;
  void (*remove)(const NetServiceRef& service, unsigned long flags) = nullptr;
  void (*resolved)(const NetServiceRef& service) = nullptr;
};

/// Creates a browser, stores it in `browser` and starts to browse `domain` for services of `type`.
/// An empty domain means all domains that the computer is configured to browse. `callbacks` may be
/// null. If `type` has no value, returns 1 and leaves `browser` unchanged. After any other failure,
/// `browser` is null.
int KSNetServiceBrowserStart(NetServiceBrowserRef& browser, const std::string& domain,
                             const std::optional<std::string>& type,
                             ServiceClientCallbacks* callbacks);

/// Stops `browser` for good. The caller keeps its reference. Returns 1 for a null browser.
int KSNetServiceBrowserStop(const NetServiceBrowserRef& browser);

/// Cancels any running resolve of `service` and starts a new one. `callbacks` may be null. A
/// resolve that fails is started again until it succeeds or is cancelled. Returns 1 for a null
/// service. Otherwise returns 0, even if the resolve cannot be started.
int KSNetServiceResolveAsync(const NetServiceRef& service, ServiceClientCallbacks* callbacks);

/// Cancels any running resolve of `service` without calling a callback. Returns 1 for a null
/// service.
int KSNetServiceCancelResolve(const NetServiceRef& service);

/// Cancels any running resolve of `service` and starts a new one. Blocks until the new one ends or
/// `timeout` seconds have passed. A timeout of 0 or less means no limit. Returns 1 if the service
/// is null or the resolve fails or times out.
int KSNetServiceResolveSync(const NetServiceRef& service, double timeout);

/// Resolves the service with this name, type and domain. Blocks as KSNetServiceResolveSync() does.
/// On success, stores the service's IPv4 addresses in `addresses`, or resets `addresses` if there
/// are none. Returns 1 and leaves `addresses` unchanged if the resolve fails or times out, or if an
/// argument is null or has no value.
int KSNetServiceCreateAndResolve(const std::optional<std::string>& name,
                                 const std::optional<std::string>& type,
                                 const std::optional<std::string>& domain,
                                 std::optional<std::vector<std::string>>* addresses,
                                 double timeout);

/// Returns the resolved service's IPv4 addresses in dotted form, in the order of
/// NetService::addressing(). Returns nothing when the service has none.
[[nodiscard]] std::optional<std::vector<std::string>> KSNetServiceCopyIPv4Addresses(
    const NetServiceRef& service);

/// Stores in `addresses` the IPv4 addresses of the device that `uri` names. A "dnssd://" or
/// "mdns://" URI must name a service in the domain "local."; KSNetServiceCreateAndResolve()
/// resolves this service. For any other URI, looks up the host and stores its first address;
/// `timeout` does not limit the look-up. Returns 1 and leaves `addresses` unchanged in these cases:
/// - `uri` has no value, is malformed or is a "usb://" URI, or `addresses` is null.
/// - The host's name is longer than 1,024 bytes, or the look-up finds no IPv4 address.
/// - The resolve fails or times out.
int KSNetServiceCopyAddressesForDeviceURI(const std::optional<std::string>& uri,
                                          std::optional<std::vector<std::string>>* addresses,
                                          double timeout);

/// Returns the URI of a device's service instance, such as
/// "dnssd://Office%20Printer._ipp._tcp.local.". The scheme is "mdns" on macOS before 10.6 and on a
/// system whose version is unknown. The URI of a "_pdl-datastream._tcp." service ends in "/?bidi".
/// Dots in the name are not escaped.
[[nodiscard]] std::string KSNetServiceCreateDeviceURI(const std::string& name,
                                                      const std::string& type,
                                                      const std::string& domain);

/// Returns the URI of `service`, or nothing for a null service. A name, type or domain that the
/// service lacks counts as empty.
[[nodiscard]] std::optional<std::string> KSNetServiceCopyDeviceURI(const NetServiceRef& service);

/// These functions return the USB model and the USB manufacturer from the service's TXT record. The
/// keys in the record depend on the service's type; see identity_keys.h. Both return nothing when
/// the value is absent or not UTF-8, when the record is absent or malformed, and when
/// identity_keys.h does not list the type.
[[nodiscard]] std::optional<std::string> KSNetServiceCopyModel(const NetServiceRef& service);
[[nodiscard]] std::optional<std::string> KSNetServiceCopyManufacturer(const NetServiceRef& service);

/// Returns the value of "note" in the service's TXT record: the device's location. Returns nothing
/// when the value is absent or not UTF-8, and when the record is absent or malformed.
[[nodiscard]] std::optional<std::string> KSNetServiceCopyNote(const NetServiceRef& service);

/// Returns the service's name. Returns nothing when the service is null or has no name.
[[nodiscard]] std::optional<std::string> KSNetServiceGetNameSafe(const NetServiceRef& service);

/// Returns whether the value of "pdl" in the service's TXT record, a list of page description
/// languages, contains "image/urf". Ignores the case of letters. The wizard does not use this
/// function.
[[nodiscard]] bool KSNetServiceSupportsURF(const NetServiceRef& service);

/// The client function of every browser. `info` is null or points to a ServiceClientCallbacks.
/// If `flags` contains kNetServiceFlagRemove, calls `remove` in `info`, otherwise `add`. Calls
/// neither if `error` reports a failure.
void KSNetServiceBrowseCallBack(const NetServiceBrowserRef& browser, unsigned long flags,
                                const NetServiceRef& service, const NetServiceError& error,
                                void* info);

/// The client function of every asynchronous resolve. `info` is null or points to a
/// ServiceClientCallbacks. After a success, calls `resolved` in `info`. After a failure, starts the
/// resolve again.
void KSNetServiceResolveCallBack(const NetServiceRef& service, const NetServiceError& error,
                                 void* info);

}  // namespace onramp
