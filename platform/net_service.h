#pragma once

#include <cstdint>
#include <memory>
#include <optional>
#include <string>
#include <vector>

#include "base/value.h"

namespace onramp {

class NetService;
class NetServiceBrowser;

/// Handles are shared; two services are the same object when their handles compare equal.
using NetServiceRef = std::shared_ptr<NetService>;
using NetServiceBrowserRef = std::shared_ptr<NetServiceBrowser>;

/// What went wrong with a browse or a resolve; 0 is success.
struct NetServiceError {
  std::int32_t code = 0;
};

inline constexpr std::int32_t kNetServiceErrorUnknown = -72000;
inline constexpr std::int32_t kNetServiceErrorTimeout = -72007;

// Flags of a browse event.
inline constexpr unsigned long kNetServiceFlagMoreComing = 1;
inline constexpr unsigned long kNetServiceFlagRemove = 8;  ///< set: gone; not set: found

/// Looks for services by DNS Service Discovery. Main thread only. The client is called on the main
/// thread, in every mode of the main loop. Destroying a browser ends it like invalidate().
class NetServiceBrowser {
 public:
  /// Called when a service is found and when it is gone. A service is a name, type and domain. It
  /// is found with its first sighting and gone with its last, however many network interfaces and
  /// protocols it is seen on; both calls carry the same object. `service` is null when `error` is
  /// set. The client may end or destroy the browser.
  using Client = void (*)(const NetServiceBrowserRef& browser, unsigned long flags,
                          const NetServiceRef& service, const NetServiceError& error, void* info);

  /// Creates a browser that calls `client` with `info`, which it neither owns nor reads. Returns
  /// null on failure.
  [[nodiscard]] static NetServiceBrowserRef create(Client client, void* info);

  NetServiceBrowser() = default;
  NetServiceBrowser(const NetServiceBrowser&) = delete;
  NetServiceBrowser& operator=(const NetServiceBrowser&) = delete;
  virtual ~NetServiceBrowser() = default;

  /// Allows calls to the client, which are none before schedule() and after unschedule().
  virtual void schedule() = 0;
  virtual void unschedule() = 0;

  /// Starts looking for `type`, such as "_ipp._tcp.", in `domain`, such as "local.". An empty
  /// domain means all domains that the computer is configured to browse, "local." included. Returns
  /// false when the search cannot start. A responder that is not running is not a failure: the
  /// search starts by itself when the responder does, and starts again after the responder has
  /// restarted.
  virtual bool searchForServices(const std::string& domain, const std::string& type) = 0;

  /// Ends the browser for good. Its client is not called again.
  virtual void invalidate() = 0;

  /// Ends the running search, if there is one. Its services are not reported as gone.
  virtual void stopSearch() = 0;
};

/// One service instance on the network, bound to no interface or protocol. Main thread only. The
/// client is called on the main thread, in every mode of the main loop. Destroying a service
/// cancels its resolve.
class NetService {
 public:
  /// Called when a resolve has ended, successfully or not. The client may cancel, resolve again or
  /// destroy the service.
  using Client = void (*)(const NetServiceRef& service, const NetServiceError& error, void* info);

  /// Creates a service to be resolved by its name. Returns null on failure.
  [[nodiscard]] static NetServiceRef create(const std::string& domain, const std::string& type,
                                            const std::string& name, std::int32_t port);

  NetService() = default;
  NetService(const NetService&) = delete;
  NetService& operator=(const NetService&) = delete;
  virtual ~NetService() = default;

  /// The instance name in UTF-8 without escapes, such as "Office Printer".
  [[nodiscard]] virtual std::optional<std::string> name() const = 0;
  /// The type with its closing dot, such as "_ipp._tcp.".
  [[nodiscard]] virtual std::optional<std::string> type() const = 0;
  /// The domain with its closing dot, such as "local.".
  [[nodiscard]] virtual std::optional<std::string> domain() const = 0;

  /// The addresses that the last resolve found, in the responder's order. Empty before, and from
  /// the start of the next resolve until that succeeds. IPv6 addresses may be missing when the host
  /// has IPv4 addresses. Each is a socket address in the BSD layout, whatever the system's own is:
  /// length, family (2 is IPv4, 30 IPv6), port in network order. An IPv4 address then has its four
  /// bytes from byte 4; an IPv6 address has its sixteen from byte 8, and its scope in the machine's
  /// byte order from byte 24.
  [[nodiscard]] virtual std::vector<Data> addressing() const = 0;

  /// The data of the TXT record that the last resolve found, as on the wire (RFC 6763 section 6).
  /// Nothing before, and from the start of the next resolve until that succeeds.
  [[nodiscard]] virtual std::optional<Data> txtData() const = 0;

  /// Sets the client that a resolve reports to. Without a client, resolves block.
  virtual void setClient(Client client, void* info) = 0;

  /// Allows calls to the client, which are none before schedule() and after unschedule().
  virtual void schedule() = 0;
  virtual void unschedule() = 0;

  /// Starts to ask the network for addresses and TXT record. 0 or less means no time limit. With a
  /// client, returns at once whether the resolve is under way, and calls the client when it ends.
  /// Without a time limit only success or cancel() ends it. Without a client, blocks and returns
  /// whether the service is resolved. Returns false while another resolve of the service runs.
  virtual bool resolveWithTimeout(double seconds) = 0;

  /// Cancels the running resolve, if there is one, without calling the client.
  virtual void cancel() = 0;
};

}  // namespace onramp
