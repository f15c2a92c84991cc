#pragma once

#include <optional>
#include <string>
#include <vector>

#include "platform/net_service.h"

namespace onramp {

// Operations on network services, for KSBonjour and the other classes in bonjour/. A function that
// returns an int returns 0 on success and 1 on failure. A function that reads a service returns
// nothing or false when the service is null. All functions must be called on the main thread.

/// The functions that receive the results of browse and resolve operations. A function pointer may
/// be null. The structure must outlive every browse and resolve that is started with it.
struct ServiceClientCallbacks {
  void (*add)(const NetServiceRef& service, unsigned long flags) = nullptr;
  void (*remove)(const NetServiceRef& service, unsigned long flags) = nullptr;
  void (*resolved)(const NetServiceRef& service) = nullptr;
};

/// Creates `browser` and starts to browse `domain` for services of `type`. An empty domain means
/// all domains that the computer is configured to browse. On failure `browser` becomes null, except
/// that it is unchanged when there is no type.
int KSNetServiceBrowserStart(NetServiceBrowserRef& browser, const std::string& domain,
                             const std::optional<std::string>& type,
                             ServiceClientCallbacks* callbacks);

/// Ends `browser` for good. The caller keeps the handle. Returns 1 for a null browser.
int KSNetServiceBrowserStop(const NetServiceBrowserRef& browser);

/// Starts to resolve `service`, after cancelling its running resolve if there is one. A resolve
/// that fails is started again, so resolving ends only with success or when it is cancelled.
/// Returns 1 for a null service and 0 for every other, even if the resolve cannot be started.
int KSNetServiceResolveAsync(const NetServiceRef& service, ServiceClientCallbacks* callbacks);

/// Cancels the running resolve of `service`, if there is one, without calling a callback. Returns 1
/// for a null service.
int KSNetServiceCancelResolve(const NetServiceRef& service);

/// Cancels the running resolve of `service`, if there is one, then resolves `service` and blocks
/// until this resolve has ended, for at most `timeout` seconds. A timeout of 0 or less means no
/// limit. Returns 1 for a null service and when the resolve does not succeed in time.
int KSNetServiceResolveSync(const NetServiceRef& service, double timeout);

/// Resolves the service with this name, type and domain as KSNetServiceResolveSync does. On success
/// `addresses` holds the service's IPv4 addresses, or nothing when there are none; on failure
/// `addresses` is unchanged. Also returns 1 when an argument is nothing or null.
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
/// "mdns://" URI must name a service in the local domain. That service is resolved as
/// KSNetServiceCreateAndResolve does. For any other URL, looks up the host without a time limit and
/// stores the host's first address. Returns 1 and leaves `addresses` unchanged for a "usb://" URI,
/// for a malformed URI, for a host name of more than 1,024 bytes, for a host without an IPv4
/// address, and when `uri` is nothing or `addresses` is null.
int KSNetServiceCopyAddressesForDeviceURI(const std::optional<std::string>& uri,
                                          std::optional<std::vector<std::string>>* addresses,
                                          double timeout);

/// The URI that names a device by its DNS-SD instance, such as
/// "dnssd://Office%20Printer._ipp._tcp.local.". The scheme is "mdns" on systems before 10.6 and on
/// a system of unknown version. The URI of a "_pdl-datastream._tcp." service ends in "/?bidi". Dots
/// in the name are not escaped.
[[nodiscard]] std::string KSNetServiceCreateDeviceURI(const std::string& name,
                                                      const std::string& type,
                                                      const std::string& domain);

/// The URI that names `service`; nothing for a null service.
[[nodiscard]] std::optional<std::string> KSNetServiceCopyDeviceURI(const NetServiceRef& service);

/// Return the USB model and the USB manufacturer in the service's TXT record. The keys in the
/// record depend on the service's type; see identity_keys.h. Both return nothing when the value is
/// absent or not UTF-8, when the record is malformed, or when identity_keys.h lacks the type.
[[nodiscard]] std::optional<std::string> KSNetServiceCopyModel(const NetServiceRef& service);
[[nodiscard]] std::optional<std::string> KSNetServiceCopyManufacturer(const NetServiceRef& service);

/// The TXT record's "note", which gives the device's location. Nothing when the note is absent or
/// not UTF-8, or when the record is malformed.
[[nodiscard]] std::optional<std::string> KSNetServiceCopyNote(const NetServiceRef& service);

/// The service's name. Nothing for a null service.
[[nodiscard]] std::optional<std::string> KSNetServiceGetNameSafe(const NetServiceRef& service);

/// Whether the page description languages under "pdl" in the TXT record include the URF raster
/// format.
[[nodiscard]] bool KSNetServiceSupportsURF(const NetServiceRef& service);

/// The client function of every browser. `info` is null or points to a ServiceClientCallbacks.
void KSNetServiceBrowseCallBack(const NetServiceBrowserRef& browser, unsigned long flags,
                                const NetServiceRef& service, const NetServiceError& error,
                                void* info);

/// The client function of every asynchronous resolve. `info` is null or points to a
/// ServiceClientCallbacks.
void KSNetServiceResolveCallBack(const NetServiceRef& service, const NetServiceError& error,
                                 void* info);

}  // namespace onramp
