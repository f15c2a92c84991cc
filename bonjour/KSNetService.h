#pragma once

#include <optional>
#include <string>
#include <vector>

#include "platform/net_service.h"

namespace onramp {

// Operations on network services, for KSBonjour and the other classes of this room. A function that
// returns an int returns 0 on success and 1 on failure. All functions must be called on the main
// thread.

/// The functions that receive the results of browse and resolve operations. A function pointer may
/// be null. The structure must outlive every browse and resolve that is started with it.
struct ServiceClientCallbacks {
  void (*add)(const NetServiceRef& service, unsigned long flags) = nullptr;
  void (*remove)(const NetServiceRef& service, unsigned long flags) = nullptr;
  void (*resolved)(const NetServiceRef& service) = nullptr;
};

/// Creates `browser` and starts to browse `domain` for services of `type`. An empty domain means
/// all browsing domains. On failure `browser` becomes null, except that it is unchanged when there
/// is no type.
int KSNetServiceBrowserStart(NetServiceBrowserRef& browser, const std::string& domain,
                             const std::optional<std::string>& type,
                             ServiceClientCallbacks* callbacks);

/// Ends the browse. The caller keeps the handle. Returns 1 for a null browser.
int KSNetServiceBrowserStop(const NetServiceBrowserRef& browser);

/// Starts to resolve `service`, after cancelling its running resolve if there is one. A failed
/// resolve is started again, so it ends only when it succeeds or is cancelled. Returns 1 for a null
/// service.
int KSNetServiceResolveAsync(const NetServiceRef& service, ServiceClientCallbacks* callbacks);

/// Cancels the running resolve of `service`, if there is one, without calling a callback. Returns 1
/// for a null service.
int KSNetServiceCancelResolve(const NetServiceRef& service);

/// Resolves `service` and blocks until the resolve has ended, for at most `timeout` seconds. A
/// timeout of 0 or less means no limit.
int KSNetServiceResolveSync(const NetServiceRef& service, double timeout);

/// Resolves the service with that name, type and domain as KSNetServiceResolveSync does. On success
/// `addresses` holds the service's IPv4 addresses, or nothing when there are none; on failure
/// `addresses` is unchanged. Returns 1 when an argument is nothing or null.
int KSNetServiceCreateAndResolve(const std::optional<std::string>& name,
                                 const std::optional<std::string>& type,
                                 const std::optional<std::string>& domain,
                                 std::optional<std::vector<std::string>>* addresses,
                                 double timeout);

/// Returns the resolved service's IPv4 addresses as dotted texts, in the order of
/// NetService::addressing(). Returns nothing when there are none.
[[nodiscard]] std::optional<std::vector<std::string>> KSNetServiceCopyIPv4Addresses(
    const NetServiceRef& service);

/// Stores in `addresses` the IPv4 addresses of the device that `uri` names. A "dnssd://" or
/// "mdns://" URI must name a service in the local domain, which is resolved within `timeout`
/// seconds. A "usb://" URI fails. For any other URL, looks up the host without a time limit and
/// stores its first address.
int KSNetServiceCopyAddressesForDeviceURI(const std::optional<std::string>& uri,
                                          std::optional<std::vector<std::string>>* addresses,
                                          double timeout);

/// The URI that names a device by its DNS-SD instance, such as
/// "dnssd://Office%20Printer._ipp._tcp.local.". The scheme is "mdns" on systems before 10.6. The
/// URI of a "_pdl-datastream._tcp." service ends in "/?bidi". Dots in the name are not escaped.
[[nodiscard]] std::string KSNetServiceCreateDeviceURI(const std::string& name,
                                                      const std::string& type,
                                                      const std::string& domain);

/// The URI that names `service`; nothing for a null service.
[[nodiscard]] std::optional<std::string> KSNetServiceCopyDeviceURI(const NetServiceRef& service);

/// Return the USB model and the USB manufacturer in the service's TXT record. The keys there depend
/// on the service's type; see identity_keys.h. Nothing when the value is absent or not UTF-8, or
/// when the type is unknown.
[[nodiscard]] std::optional<std::string> KSNetServiceCopyModel(const NetServiceRef& service);
[[nodiscard]] std::optional<std::string> KSNetServiceCopyManufacturer(const NetServiceRef& service);

/// The TXT record's "note", which gives the device's location. Nothing when the note is absent or
/// not UTF-8.
[[nodiscard]] std::optional<std::string> KSNetServiceCopyNote(const NetServiceRef& service);

/// The service's name. Nothing for a null service.
[[nodiscard]] std::optional<std::string> KSNetServiceGetNameSafe(const NetServiceRef& service);

/// Whether the page description languages in the TXT record include the URF raster format.
[[nodiscard]] bool KSNetServiceSupportsURF(const NetServiceRef& service);

/// The client function of every browser. `info` points to a ServiceClientCallbacks.
void KSNetServiceBrowseCallBack(const NetServiceBrowserRef& browser, unsigned long flags,
                                const NetServiceRef& service, const NetServiceError& error,
                                void* info);

/// The client function of every asynchronous resolve. `info` points to a ServiceClientCallbacks.
void KSNetServiceResolveCallBack(const NetServiceRef& service, const NetServiceError& error,
                                 void* info);

}  // namespace onramp
