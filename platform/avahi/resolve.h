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

/// The result of a resolve, in the form of NetService::addressing() and txtData().
struct Resolution {
  std::vector<Data> addressing;
  Data txt;
};

/// Looks for the server, the TXT record and the addresses of one service, on any interface and
/// protocol. It goes on until it has all of them or its time is up. When the daemon goes away, it
/// begins again with the next one.
class Resolve {
 public:
  /// Called once, from within the daemon's loop, and with nothing when the time is up. It must not
  /// destroy the resolve.
  using Report = std::function<void(std::optional<Resolution>)>;

  /// The daemon must outlive the resolve.
  Resolve(Daemon& daemon, const Instance& service,
          std::optional<std::chrono::milliseconds> timeLimit, Report report);

  /// Whether the daemon says that no service can have that name.
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
  Instance name_;
  Report report_;
  Timer check_;  ///< due after a change, when all messages are read
  Timer timeUp_;
  Timer graceForIPv4_;
  bool isGraceOver_ = false;
  unsigned losses_ = 0;  ///< of the daemon, when the resolve began
  // A daemon allows each client a limited number of questions, so each ends with its answer.
  std::optional<Query> service_;
  std::optional<Records> ipv4_;
  std::optional<Records> ipv6_;
  std::string host_;  ///< empty until the service is known
  std::uint16_t port_ = 0;
  Data txt_;
};

}  // namespace onramp::avahi
