#pragma once

#include <chrono>
#include <cstdint>
#include <memory>
#include <optional>
#include <string>
#include <vector>

#include "base/value.h"

namespace onramp {

class NetService;
class NetServiceBrowser;

/// Shared handles. Handles to the same object compare equal.
using NetServiceRef = std::shared_ptr<NetService>;
using NetServiceBrowserRef = std::shared_ptr<NetServiceBrowser>;

/// The error of a search or a resolve. The code 0 means success.
struct NetServiceError {
  std::int32_t code = 0;
};

inline constexpr std::int32_t kNetServiceErrorUnknown = -72000;
inline constexpr std::int32_t kNetServiceErrorTimeout = -72007;

// The flags that a NetServiceBrowser passes to its client.

/// More calls of the client may follow at once. Only the backend for macOS sets this flag.
inline constexpr unsigned long kNetServiceFlagMoreComing = 1;
/// The service is gone. Without this flag, the service has been found.
inline constexpr unsigned long kNetServiceFlagRemove = 8;

/// Searches for services with DNS Service Discovery. The responder, a system program, does the
/// actual work. Main thread only. The client is called on the main thread, even while a modal
/// window is shown. Destroying a browser has the same effect as invalidate().
class NetServiceBrowser {
 public:
  /// Called when a service is found and when it is gone. Both calls pass the same `service`. A
  /// service is identified by its name, type and domain. It is found when it first appears on any
  /// network interface and protocol, and gone when it has disappeared from all of them or the
  /// search stops covering its domain. When a running search fails, all its services are reported
  /// as gone, and the search restarts automatically. Some backends report the failure in one more
  /// call, with a null `service` and an `error` whose code is not 0. The client may call
  /// invalidate() or destroy the browser.
  using Client = void (*)(const NetServiceBrowserRef& browser, unsigned long flags,
                          const NetServiceRef& service, const NetServiceError& error, void* info);

  /// Creates a browser that calls `client` with `info`, which the browser neither owns nor reads.
  /// Returns null on failure.
  [[nodiscard]] static NetServiceBrowserRef create(Client client, void* info);

  NetServiceBrowser() = default;
  NetServiceBrowser(const NetServiceBrowser&) = delete;
  NetServiceBrowser& operator=(const NetServiceBrowser&) = delete;
  virtual ~NetServiceBrowser() = default;

  /// The client is called only between schedule() and unschedule().
  virtual void schedule() = 0;
  virtual void unschedule() = 0;

  /// Starts a search for services of this `type`, such as "_ipp._tcp.", in `domain`, such as
  /// "local.". An empty `domain` means "local." and all other domains that the computer or its
  /// network recommends for browsing (RFC 6763 section 11). Returns false when the search cannot
  /// start, for example because this browser is already searching. A search can start even if the
  /// responder is not running, and finds services once the responder runs. When the responder
  /// restarts, the search restarts automatically.
  virtual bool searchForServices(const std::string& domain, const std::string& type) = 0;

  /// Stops the browser for good. The client is not called again.
  virtual void invalidate() = 0;

  /// Stops the running search, if there is one. The search's services are not reported as gone.
  virtual void stopSearch() = 0;
};

/// One service on the network. It may be available on several network interfaces and protocols. A
/// resolve asks the network for the service's addresses and TXT record. Main thread only. The
/// client is called on the main thread, even while a modal window is shown. Destroying a service
/// cancels its resolve.
class NetService {
 public:
  /// Called when a resolve has ended. The code in `error` is 0 after success and
  /// kNetServiceErrorTimeout after the time limit. A backend may report other errors. The client
  /// may call any function of the service, or destroy the service.
  using Client = void (*)(const NetServiceRef& service, const NetServiceError& error, void* info);

  /// Creates a service with this domain, type and name. `port` has no effect on a resolve. Returns
  /// null on failure.
  [[nodiscard]] static NetServiceRef create(const std::string& domain, const std::string& type,
                                            const std::string& name, std::int32_t port);

  NetService() = default;
  NetService(const NetService&) = delete;
  NetService& operator=(const NetService&) = delete;
  virtual ~NetService() = default;

  /// Returns the service's name in UTF-8 without escapes, such as "Office Printer". name(), type()
  /// and domain() return nothing when the system does not report the value.
  [[nodiscard]] virtual std::optional<std::string> name() const = 0;
  /// Returns the type with its trailing dot, such as "_ipp._tcp.".
  [[nodiscard]] virtual std::optional<std::string> type() const = 0;
  /// Returns the domain with its trailing dot, such as "local.".
  [[nodiscard]] virtual std::optional<std::string> domain() const = 0;

  /// Returns the addresses that the last resolve found, in the responder's order. If the last
  /// resolve has not succeeded, the list is empty. IPv6 addresses may be missing when the host has
  /// IPv4 addresses. Each address is a socket address in the BSD layout, even on a system that uses
  /// another layout. Byte 0 is the length, byte 1 the family (2 for IPv4, 30 for IPv6), and bytes 2
  /// and 3 are the port in network order. The four bytes of an IPv4 address start at byte 4. The
  /// sixteen bytes of an IPv6 address start at byte 8. Bytes 24 to 27 are the scope of the IPv6
  /// address, in the machine's byte order.
  [[nodiscard]] virtual std::vector<Data> addressing() const = 0;

  /// Returns the data of the TXT record that the last resolve found, in the wire format (RFC 6763
  /// section 6). Returns nothing if the last resolve has not succeeded.
  [[nodiscard]] virtual std::optional<Data> txtData() const = 0;

  /// Sets the client, which is called when a resolve ends. A null `client` removes the client.
  virtual void setClient(Client client, void* info) = 0;

  /// The client is called only between schedule() and unschedule().
  virtual void schedule() = 0;
  virtual void unschedule() = 0;

  /// Resolves the service. If `timeLimit` is 0 or less, there is no time limit. With a client,
  /// returns at once; the result says whether the resolve has started. The client is called when
  /// the resolve ends. Without a client, blocks until the resolve ends and returns whether it
  /// succeeded. Returns false when a resolve of this object is already running.
  virtual bool resolveWithTimeout(std::chrono::duration<double> timeLimit) = 0;

  /// Cancels the running resolve, if there is one, without calling the client.
  virtual void cancel() = 0;
};

}  // namespace onramp
