#pragma once

#include <avahi-common/address.h>
#include <avahi-common/defs.h>

#include <cstddef>
#include <cstdint>
#include <functional>
#include <memory>
#include <span>
#include <string>

#include "platform/avahi/bus.h"

namespace onramp::avahi {

/// Tells of the records of one name and type for as long as it lives. The daemon does for 10 ms
/// nothing about what libavahi-client asks of it, which is as long as all else that a resolve
/// takes; by the interface of Avahi 0.8 it starts when it is told to. On the loop's thread only.
class RecordBrowser {
 public:
  /// What avahi-client's record browser tells, of which this is the part that is of use here. The
  /// data is valid for the call.
  struct Event {
    AvahiBrowserEvent kind;
    AvahiProtocol protocol = AVAHI_PROTO_UNSPEC;
    std::uint16_t type = 0;
    std::span<const std::byte> data{};
  };
  using Report = std::function<void(const Event&)>;

  /// The bus must outlive it. `report` is called from within the loop; with AVAHI_BROWSER_FAILURE
  /// when the daemon would not.
  RecordBrowser(Bus& bus, AvahiIfIndex interface, const std::string& name, std::uint16_t type,
                Report report);
  RecordBrowser(const RecordBrowser&) = delete;
  RecordBrowser& operator=(const RecordBrowser&) = delete;
  ~RecordBrowser();

 private:
  struct Object;

  // The daemon's answer may come when this is gone, and then has to be told so.
  std::shared_ptr<Object> object_;
};

}  // namespace onramp::avahi
