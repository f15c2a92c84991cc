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

/// What went wrong with a browse or a resolve. A code of 0 is success.
struct NetServiceError {
  std::int32_t code = 0;
};

inline constexpr std::int32_t kNetServiceErrorUnknown = -72000;
inline constexpr std::int32_t kNetServiceErrorTimeout = -72007;

// Flags of a browse event.
inline constexpr unsigned long kNetServiceFlagMoreComing = 1;
inline constexpr unsigned long kNetServiceFlagRemove = 8;  ///< gone, where without it: found

/// Looks for services by DNS Service Discovery. Main thread only; its client is called on the main
/// thread, in every mode of the main loop. Destroying a browser ends it like invalidate().
class NetServiceBrowser {
 public:
  /// Told of every service found or gone, once for each network interface and protocol on which it
  /// is seen. `service` is null when `error` is set. May end the browser from within.
  using Client = void (*)(const NetServiceBrowserRef& browser, unsigned long flags,
                          const NetServiceRef& service, const NetServiceError& error, void* info);

  /// A browser that hands `info` to `client` with each event; null when it cannot be had. `info`
  /// is neither owned nor read.
  [[nodiscard]] static NetServiceBrowserRef create(Client client, void* info);

  NetServiceBrowser() = default;
  NetServiceBrowser(const NetServiceBrowser&) = delete;
  NetServiceBrowser& operator=(const NetServiceBrowser&) = delete;
  virtual ~NetServiceBrowser() = default;

  /// Lets events through to the client. None arrives before this, none after unschedule().
  virtual void schedule() = 0;
  virtual void unschedule() = 0;

  /// Starts looking for `type`, such as "_ipp._tcp.", in `domain`; an empty domain stands for all
  /// default browsing domains. False when the search cannot start; a responder that is not running
  /// is no such case: the search goes on by itself once it runs.
  virtual bool searchForServices(const std::string& domain, const std::string& type) = 0;

  /// Ends the browser for good: its client is never called again.
  virtual void invalidate() = 0;

  /// Ends the running search; without one, nothing.
  virtual void stopSearch() = 0;
};

/// One service instance on the network. Main thread only; its client is called on the main thread,
/// in every mode of the main loop. Destroying a service cancels its resolve.
class NetService {
 public:
  /// Told that a resolve has ended, well or not. May cancel, resolve again or drop the service from
  /// within.
  using Client = void (*)(const NetServiceRef& service, const NetServiceError& error, void* info);

  /// A service to be resolved by its name. Null when it cannot be had.
  [[nodiscard]] static NetServiceRef create(const std::string& domain, const std::string& type,
                                            const std::string& name, std::int32_t port);

  NetService() = default;
  NetService(const NetService&) = delete;
  NetService& operator=(const NetService&) = delete;
  virtual ~NetService() = default;

  /// The instance name in UTF-8 without any escapes, such as "Office Printer".
  [[nodiscard]] virtual std::optional<std::string> name() const = 0;
  /// The type with its closing dot, such as "_ipp._tcp.".
  [[nodiscard]] virtual std::optional<std::string> type() const = 0;
  /// The domain with its closing dot, such as "local.".
  [[nodiscard]] virtual std::optional<std::string> domain() const = 0;

  /// The addresses found by the last successful resolve, in the responder's order; empty before.
  /// Each is a socket address in the BSD layout, whatever the system's own is: length, family (2 is
  /// IPv4, 30 IPv6), port in network order; an IPv4 address then has its four bytes from byte 4, an
  /// IPv6 address its sixteen from byte 8 and its scope in the machine's byte order from byte 24.
  [[nodiscard]] virtual std::vector<Data> addressing() const = 0;

  /// The TXT record's data as it was on the wire (RFC 6763 section 6) at the last successful
  /// resolve; nothing before.
  [[nodiscard]] virtual std::optional<Data> txtData() const = 0;

  /// Names whom a resolve reports to; a null client makes resolves blocking.
  virtual void setClient(Client client, void* info) = 0;

  /// Lets results through to the client. None arrives before this, none after unschedule().
  virtual void schedule() = 0;
  virtual void unschedule() = 0;

  /// Asks the network for addresses and TXT record. 0 or less means no time limit. With a client:
  /// returns at once, true when the resolve is under way, and the client is told when it ends;
  /// without a limit it ends by success or by cancel() alone. Without a client: blocks, true when
  /// resolved. One resolve at a time: false while another one runs.
  virtual bool resolveWithTimeout(double seconds) = 0;

  /// Drops the running resolve without telling the client; without one, nothing.
  virtual void cancel() = 0;
};

}  // namespace onramp
