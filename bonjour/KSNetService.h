#pragma once

#include <optional>
#include <string>
#include <vector>

#include "platform/net_service.h"

namespace onramp {

// Operations on network services, on which the classes in bonjour/ are built. A function whose
// result is an int returns 0 on success and 1 on failure. For a null service, a function that reads
// the service returns nothing or false. All functions must be called on the main thread.

/// The functions that receive the results of browses and resolves: a service is found, is gone, or
/// has been resolved. Each pointer may be null. `flags` are those of NetServiceBrowser. The
/// structure must outlive every browse and resolve that is started with it.
struct ServiceClientCallbacks {
  void (*add)(const NetServiceRef& service, unsigned long flags) = nullptr;
  void (*remove)(const NetServiceRef& service, unsigned long flags) = nullptr;
  void (*resolved)(const NetServiceRef& service) = nullptr;
};

/// Creates a browser, stores it in `browser` and starts to browse `domain` for services of `type`.
/// An empty domain means all domains that the computer is configured to browse. `callbacks` may be
/// null. If `type` is nothing, returns 1 and leaves `browser` unchanged. After any other failure,
/// `browser` is null.
int KSNetServiceBrowserStart(NetServiceBrowserRef& browser, const std::string& domain,
                             const std::optional<std::string>& type,
                             ServiceClientCallbacks* callbacks);

/// Ends `browser` for good. Does not release the caller's reference. Returns 1 for a null browser.
int KSNetServiceBrowserStop(const NetServiceBrowserRef& browser);

/// Starts to resolve `service`, after cancelling its running resolve if there is one. `callbacks`
/// may be null. A resolve that fails is started again, so resolving ends only when it succeeds or
/// is cancelled. Returns 1 for a null service. Otherwise returns 0, even if the resolve cannot be
/// started.
int KSNetServiceResolveAsync(const NetServiceRef& service, ServiceClientCallbacks* callbacks);

/// Cancels the running resolve of `service`, if there is one, without calling a callback. Returns 1
/// for a null service.
int KSNetServiceCancelResolve(const NetServiceRef& service);

/// Cancels the running resolve of `service`, if there is one. Then resolves `service` and blocks
/// until the resolve has ended, for at most `timeout` seconds. A timeout of 0 or less means no
/// limit. Returns 1 for a null service and when the resolve fails or does not end in time.
int KSNetServiceResolveSync(const NetServiceRef& service, double timeout);

/// Resolves the service with this name, type and domain, and blocks as KSNetServiceResolveSync()
/// does. On success, sets `addresses` to the service's IPv4 addresses, or to nothing when there are
/// none. Returns 1 and leaves `addresses` unchanged when the resolve does not succeed and when an
/// argument is nothing or null.
int KSNetServiceCreateAndResolve(const std::optional<std::string>& name,
                                 const std::optional<std::string>& type,
                                 const std::optional<std::string>& domain,
                                 std::optional<std::vector<std::string>>* addresses,
                                 double timeout);

/// Returns the resolved service's IPv4 addresses as dotted texts, in the order of
/// NetService::addressing(). Returns nothing when the service has none.
[[nodiscard]] std::optional<std::vector<std::string>> KSNetServiceCopyIPv4Addresses(
    const NetServiceRef& service);

/// Stores in `addresses` the IPv4 addresses of the device that `uri` names. A "dnssd://" or
/// "mdns://" URI must name a service in the domain "local."; KSNetServiceCreateAndResolve()
/// resolves that service. For any other URL, looks up the host and stores the host's first address;
/// `timeout` does not limit the look-up. On failure, returns 1 and leaves `addresses` unchanged.
/// The function fails when `uri` is nothing, malformed or a "usb://" URI, when `addresses` is null,
/// when the host's name has more than 1,024 bytes or no IPv4 address is found for it, and when the
/// resolve does not succeed.
int KSNetServiceCopyAddressesForDeviceURI(const std::optional<std::string>& uri,
                                          std::optional<std::vector<std::string>>* addresses,
                                          double timeout);

/// Returns the URI of a device's service instance, such as
/// "dnssd://Office%20Printer._ipp._tcp.local.". The scheme is "mdns" before macOS 10.6 and when the
/// system's version is unknown. The URI of a "_pdl-datastream._tcp." service ends in "/?bidi". Dots
/// in the name are not escaped.
[[nodiscard]] std::string KSNetServiceCreateDeviceURI(const std::string& name,
                                                      const std::string& type,
                                                      const std::string& domain);

/// Returns the URI of `service`, or nothing for a null service. A name, type or domain that the
/// service lacks counts as empty.
[[nodiscard]] std::optional<std::string> KSNetServiceCopyDeviceURI(const NetServiceRef& service);

/// These two functions return the USB model and the USB manufacturer from the service's TXT record.
/// The keys in the record depend on the service's type; see identity_keys.h. Both functions return
/// nothing when the value is absent or not UTF-8, when the record is absent or malformed, and when
/// identity_keys.h does not list the type.
[[nodiscard]] std::optional<std::string> KSNetServiceCopyModel(const NetServiceRef& service);
[[nodiscard]] std::optional<std::string> KSNetServiceCopyManufacturer(const NetServiceRef& service);

/// Returns the value of "note" in the service's TXT record: the device's location. Returns nothing
/// when the value is absent or not UTF-8, and when the record is absent or malformed.
[[nodiscard]] std::optional<std::string> KSNetServiceCopyNote(const NetServiceRef& service);

/// Returns the service's name. Returns nothing when the service is null or has no name.
[[nodiscard]] std::optional<std::string> KSNetServiceGetNameSafe(const NetServiceRef& service);

/// Returns whether the value of "pdl" in the service's TXT record, a list of page description
/// languages, contains "image/urf" in upper or lower case. The program does not use this function.
[[nodiscard]] bool KSNetServiceSupportsURF(const NetServiceRef& service);

/// The client function of every browser. `info` is null or points to a ServiceClientCallbacks.
/// Calls `add` or `remove`, and nothing when `error` reports a failure.
void KSNetServiceBrowseCallBack(const NetServiceBrowserRef& browser, unsigned long flags,
                                const NetServiceRef& service, const NetServiceError& error,
                                void* info);

/// The client function of every asynchronous resolve. `info` is null or points to a
/// ServiceClientCallbacks. Calls `resolved` after success, and resolves again after a failure.
void KSNetServiceResolveCallBack(const NetServiceRef& service, const NetServiceError& error,
                                 void* info);

}  // namespace onramp
