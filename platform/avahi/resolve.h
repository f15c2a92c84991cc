#pragma once

#include <chrono>
#include <cstdint>
#include <functional>
#include <optional>
#include <string>
#include <vector>

#include "base/value.h"
#include "platform/avahi/daemon.h"
#include "platform/avahi/records.h"
#include "platform/avahi/timer.h"

namespace onramp::avahi {

/// The result of a resolve, in the formats of NetService::addressing() and txtData().
struct Resolution {
  std::vector<Data> addressing;
  Data txt;
};

/// The host and port on which a service is offered, and the data of the service's TXT record.
struct Server {
  std::string host;  ///< a domain name with escapes and without a trailing dot
  std::uint16_t port = 0;
  Data txt;
};

/// Looks up the host, the port, the TXT record and the addresses of one service, on any interface
/// and protocol. Ends when all of these are known or the time is up. If the daemon goes away, the
/// resolve starts again when the daemon is back.
class Resolve {
 public:
  /// Called when the resolve ends, at most once, from inside sd-event's loop. The argument has no
  /// value when the time is up. The function must not destroy the resolve.
  using Report = std::function<void(std::optional<Resolution>)>;

  /// The daemon must outlive the resolve. Without a `timeLimit`, the resolve may run forever.
  Resolve(Daemon& daemon, const Instance& service,
          std::optional<std::chrono::milliseconds> timeLimit, Report report);

  /// Returns true if the service cannot be looked up because its name, type or domain is invalid.
  [[nodiscard]] bool isRefused() const { return service_ && service_->isRefused(); }

 private:
  void begin();
  void happened(Query::Event event, sd_bus_message* message);
  void ask(std::optional<Records>& addresses, RecordType type);
  void checkSoon();
  void check();
  [[nodiscard]] const Records* knownAddresses();
  void end(std::optional<Resolution> resolution);

  Daemon& daemon_;
  Instance instance_;
  Report report_;
  Timer check_;  ///< runs after a change, when all waiting messages have been read
  Timer timeUp_;
  Timer graceForIPv4_;
  bool isGraceOver_ = false;
  unsigned losses_ = 0;           ///< the daemon's losses() when the resolve last began
  std::optional<Server> server_;  ///< no value until the daemon has named the host
  // This query is destroyed as soon as it is answered, because the daemon limits the number of
  // queries that a program may have open.
  std::optional<Query> service_;
  std::optional<Records> ipv4_;
  std::optional<Records> ipv6_;
};

}  // namespace onramp::avahi
