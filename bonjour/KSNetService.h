#pragma once

#include <optional>
#include <string>
#include <vector>

#include "platform/net_service.h"

namespace onramp {

// The operations on network services that the browser classes use. A status is 0 for success and 1
// for failure. Main thread only.

/// The functions that receive the results of browse and resolve operations. A slot may be null. The
/// table has to outlive every browse and resolve that is started with it.
struct ServiceClientCallbacks {
  void (*add)(const NetServiceRef& service, unsigned long flags) = nullptr;
  void (*remove)(const NetServiceRef& service, unsigned long flags) = nullptr;
  void (*resolved)(const NetServiceRef& service) = nullptr;
};

/// Starts to browse `domain` for `type`; "" means all browsing domains. On failure the browser is
/// null afterwards, but a null type leaves it unchanged.
int KSNetServiceBrowserStart(NetServiceBrowserRef& browser, const std::string& domain,
                             const std::optional<std::string>& type,
                             ServiceClientCallbacks* callbacks);

/// Ends the browse. The caller keeps the handle. Returns 1 for a null browser.
int KSNetServiceBrowserStop(const NetServiceBrowserRef& browser);

/// Starts to resolve `service`, after cancelling a resolve that is under way. It goes on until it
/// succeeds or is cancelled. Returns 1 for a null service.
int KSNetServiceResolveAsync(const NetServiceRef& service, ServiceClientCallbacks* callbacks);

/// Ends a resolve, if there is one, without calling back. Returns 1 for a null service.
int KSNetServiceCancelResolve(const NetServiceRef& service);

/// Resolves `service` and blocks until that has ended, for at most `timeout` seconds. 0 or less
/// means no limit.
int KSNetServiceResolveSync(const NetServiceRef& service, double timeout);

/// Resolves the service of that name as KSNetServiceResolveSync does. On success `addresses` holds
/// its IPv4 addresses, or nothing when there are none; on failure `addresses` is unchanged. Returns
/// 1 when an argument is null.
int KSNetServiceCreateAndResolve(const std::optional<std::string>& name,
                                 const std::optional<std::string>& type,
                                 const std::optional<std::string>& domain,
                                 std::optional<std::vector<std::string>>* addresses,
                                 double timeout);

/// The resolved service's IPv4 addresses as dotted text, in the order of NetService::addressing().
/// Nothing when there are none.
[[nodiscard]] std::optional<std::vector<std::string>> KSNetServiceCopyIPv4Addresses(
    const NetServiceRef& service);

/// Stores the IPv4 addresses of the device that `uri` names. For a "dnssd://" or "mdns://" URI in
/// the local domain, resolves the service that it names, within `timeout` seconds. For any other
/// URL but a "usb://" one, looks up the host and gives its first address, without a time limit.
int KSNetServiceCopyAddressesForDeviceURI(const std::optional<std::string>& uri,
                                          std::optional<std::vector<std::string>>* addresses,
                                          double timeout);

/// The URI that names a device by its DNS-SD instance, such as
/// "dnssd://Office%20Printer._ipp._tcp.local.". Its scheme is "mdns" before system 10.6. Dots in
/// the name are not escaped.
[[nodiscard]] std::string KSNetServiceCreateDeviceURI(const std::string& name,
                                                      const std::string& type,
                                                      const std::string& domain);

/// The URI that names `service`. Nothing for a null one.
[[nodiscard]] std::optional<std::string> KSNetServiceCopyDeviceURI(const NetServiceRef& service);

/// The USB model and manufacturer that the service's TXT record gives, under keys that depend on
/// the service's type. Nothing when the value is absent or not UTF-8, or when the type is unknown.
[[nodiscard]] std::optional<std::string> KSNetServiceCopyModel(const NetServiceRef& service);
[[nodiscard]] std::optional<std::string> KSNetServiceCopyManufacturer(const NetServiceRef& service);

/// The TXT record's "note", which gives the device's location. Nothing when it is absent or not
/// UTF-8.
[[nodiscard]] std::optional<std::string> KSNetServiceCopyNote(const NetServiceRef& service);

/// The service's name. Nothing for a null service.
[[nodiscard]] std::optional<std::string> KSNetServiceGetNameSafe(const NetServiceRef& service);

/// Whether the TXT record's page description languages include the URF raster format.
[[nodiscard]] bool KSNetServiceSupportsURF(const NetServiceRef& service);

/// The client of every browser; `info` is a ServiceClientCallbacks.
void KSNetServiceBrowseCallBack(const NetServiceBrowserRef& browser, unsigned long flags,
                                const NetServiceRef& service, const NetServiceError& error,
                                void* info);

/// The client of every asynchronous resolve; `info` is a ServiceClientCallbacks.
void KSNetServiceResolveCallBack(const NetServiceRef& service, const NetServiceError& error,
                                 void* info);

}  // namespace onramp
