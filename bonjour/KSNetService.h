#pragma once

#include <optional>
#include <string>
#include <vector>

#include "platform/net_service.h"

namespace onramp {

// The operations on network services that the browser classes are made of. Statuses are 0 for
// success and 1 for failure. Main thread only.

/// Who is told what browses and resolves find. A slot may be empty. The table has to outlive every
/// browse and resolve that was started with it.
struct ServiceClientCallbacks {
  void (*add)(const NetServiceRef& service, unsigned long flags) = nullptr;
  void (*remove)(const NetServiceRef& service, unsigned long flags) = nullptr;
  void (*resolved)(const NetServiceRef& service) = nullptr;
};

/// Starts to browse `domain` ("" for all default browsing domains) for `type`. On failure the
/// browser is null, except that a null type leaves it as it was.
int KSNetServiceBrowserStart(NetServiceBrowserRef& browser, const std::string& domain,
                             const std::optional<std::string>& type,
                             ServiceClientCallbacks* callbacks);

/// Ends the browse; the handle stays its owner's. 1 for a null browser.
int KSNetServiceBrowserStop(const NetServiceBrowserRef& browser);

/// Starts to resolve `service`, anew if that is under way already, until it succeeds or is
/// cancelled. 1 for a null service.
int KSNetServiceResolveAsync(const NetServiceRef& service, ServiceClientCallbacks* callbacks);

/// Ends a resolve, if there is one, without a call back. 1 for a null service.
int KSNetServiceCancelResolve(const NetServiceRef& service);

/// Resolves `service` and blocks meanwhile, for `timeout` seconds at most (0 or less: no limit).
int KSNetServiceResolveSync(const NetServiceRef& service, double timeout);

/// Resolves the service of that name like KSNetServiceResolveSync. On success `addresses` has its
/// IPv4 addresses, or nothing when it has none; on failure it is left as it was. 1 when anything is
/// null.
int KSNetServiceCreateAndResolve(const std::optional<std::string>& name,
                                 const std::optional<std::string>& type,
                                 const std::optional<std::string>& domain,
                                 std::optional<std::vector<std::string>>* addresses,
                                 double timeout);

/// The resolved service's IPv4 addresses, dotted, in the order of its addressing; nothing when it
/// has none.
[[nodiscard]] std::optional<std::vector<std::string>> KSNetServiceCopyIPv4Addresses(
    const NetServiceRef& service);

/// The IPv4 addresses of the device that `uri` names: a service's, resolved within `timeout`
/// seconds, for a "dnssd://" or "mdns://" URI of the local domain; else the first address of the
/// URL's host, without a time limit. 1 when they cannot be had, as for a "usb://" URI.
int KSNetServiceCopyAddressesForDeviceURI(const std::optional<std::string>& uri,
                                          std::optional<std::vector<std::string>>* addresses,
                                          double timeout);

/// The URI that names a device by its DNS-SD instance, such as
/// "dnssd://Office%20Printer._ipp._tcp.local.". Its scheme is "mdns" before system 10.6. Dots in
/// the name are not escaped.
[[nodiscard]] std::string KSNetServiceCreateDeviceURI(const std::string& name,
                                                      const std::string& type,
                                                      const std::string& domain);

/// The same for `service`; nothing for a null one.
[[nodiscard]] std::optional<std::string> KSNetServiceCopyDeviceURI(const NetServiceRef& service);

/// The USB model and manufacturer that the service's TXT record gives, under keys that depend on
/// its type; nothing when absent, not UTF-8, or of an unknown type.
[[nodiscard]] std::optional<std::string> KSNetServiceCopyModel(const NetServiceRef& service);
[[nodiscard]] std::optional<std::string> KSNetServiceCopyManufacturer(const NetServiceRef& service);

/// The TXT record's "note", where the device stands; nothing when absent or not UTF-8.
[[nodiscard]] std::optional<std::string> KSNetServiceCopyNote(const NetServiceRef& service);

[[nodiscard]] std::optional<std::string> KSNetServiceGetNameSafe(const NetServiceRef& service);

/// Whether the TXT record's page description languages have the URF raster format.
[[nodiscard]] bool KSNetServiceSupportsURF(const NetServiceRef& service);

/// The client of every browser; `info` is a ServiceClientCallbacks.
void KSNetServiceBrowseCallBack(const NetServiceBrowserRef& browser, unsigned long flags,
                                const NetServiceRef& service, const NetServiceError& error,
                                void* info);

/// The client of every asynchronous resolve; `info` is a ServiceClientCallbacks.
void KSNetServiceResolveCallBack(const NetServiceRef& service, const NetServiceError& error,
                                 void* info);

}  // namespace onramp
