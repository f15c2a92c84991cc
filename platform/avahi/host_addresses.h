#pragma once

#include <avahi-common/address.h>

#include <cstdint>
#include <functional>
#include <memory>
#include <optional>
#include <string>
#include <vector>

#include "platform/avahi/loop.h"
#include "platform/avahi/record_browser.h"

namespace onramp::avahi {

class Connection;

/// All addresses of a host on one interface. (Avahi's resolver gives one address only, and that of
/// the family that the service was found by.) IPv6 is asked for where somebody wants it or nothing
/// else is there, since each question is one more for the daemon. On the loop's thread only.
class HostAddresses : public std::enable_shared_from_this<HostAddresses> {
 public:
  /// Starts to look.
  [[nodiscard]] static std::shared_ptr<HostAddresses> lookUp(Connection& connection,
                                                             AvahiIfIndex interface,
                                                             const std::string& host);

  /// Asks for IPv6 addresses too.
  void wantIPv6();

  /// Calls `action` once, outside of any callback of Avahi: with true when addresses are known and
  /// either one is IPv4 or there has been time enough for one, with false when the daemon failed.
  /// Dropped with the last holder of this object.
  void whenKnown(std::function<void(bool known)> action);

  /// The addresses in the order in which the daemon told of them, each once.
  [[nodiscard]] std::vector<AvahiAddress> addresses() const;

  [[nodiscard]] AvahiIfIndex interface() const { return interface_; }

 private:
  struct Record {
    AvahiProtocol heardBy;
    AvahiAddress address;
  };

  HostAddresses(Connection& connection, AvahiIfIndex interface, std::string host);

  void browse(std::optional<RecordBrowser>& browser, std::uint16_t type);
  void happened(const RecordBrowser::Event& event);
  void exhausted();
  void fail();
  void check();
  [[nodiscard]] bool known() const;

  Connection& connection_;
  AvahiIfIndex interface_;
  std::string host_;
  std::vector<Record> records_;
  std::vector<std::function<void(bool known)>> waiting_;
  int unanswered_ = 0;  ///< browsers that still go through what is known at once
  bool patient_ = true;
  bool failed_ = false;
  Timer patience_;
  std::optional<RecordBrowser> ipv4_;
  std::optional<RecordBrowser> ipv6_;
};

}  // namespace onramp::avahi
