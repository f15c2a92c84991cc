#pragma once

#include <cstdint>
#include <functional>
#include <optional>
#include <string>
#include <tuple>
#include <vector>

#include "base/value.h"
#include "platform/avahi/query.h"

namespace onramp::avahi {

/// The three parts of a service's full name. As in the daemon's messages, the name has no escapes,
/// and the type and the domain have no trailing dots.
struct Instance {
  std::string name;
  std::string type;
  std::string domain;
  friend bool operator<(const Instance& a, const Instance& b) {
    return std::tie(a.name, a.type, a.domain) < std::tie(b.name, b.type, b.domain);
  }
};

/// The DNS record types that this backend uses (RFC 1035 section 3.2.2, RFC 3596).
enum class RecordType : std::uint16_t { kIPv4 = 1, kIPv6 = 28 };

/// The current DNS records of one name and type, from all interfaces and protocols.
class Records {
 public:
  struct Record {
    std::int32_t interface;
    std::int32_t protocol;
    Data data;  ///< the address, as on the wire
    friend bool operator==(const Record&, const Record&) = default;
  };

  /// `name` is a domain name with escapes and without a trailing dot. `changed` is called from
  /// inside sd-event's loop whenever all() or isCacheExhausted() may have changed, and must not
  /// destroy this object.
  Records(Daemon& daemon, const std::string& name, RecordType type, std::function<void()> changed);

  /// Returns the current records in the order in which the daemon reported them.
  [[nodiscard]] const std::vector<Record>& all() const { return records_; }

  /// Returns whether the daemon has reported everything in its cache.
  [[nodiscard]] bool isCacheExhausted() const { return isCacheExhausted_; }

 private:
  void happened(Query::Event event, sd_bus_message* message);

  std::function<void()> changed_;
  std::vector<Record> records_;
  bool isCacheExhausted_ = false;
  Query query_;
};

/// Converts an address record to a socket address in the layout that NetService::addressing()
/// describes. Returns nothing when the record's data has the size of neither an IPv4 nor an IPv6
/// address.
[[nodiscard]] std::optional<Data> socketAddress(const Records::Record& record, std::uint16_t port);

}  // namespace onramp::avahi
