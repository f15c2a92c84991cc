#pragma once

#include <systemd/sd-bus.h>

#include <functional>
#include <map>
#include <memory>
#include <string>

#include "platform/avahi/handles.h"
#include "platform/avahi/loop.h"

namespace onramp::avahi {

/// A connection to the system's message bus that never blocks, for what libavahi-client does not
/// offer. On the loop's thread only.
class Bus {
 public:
  using Receiver = std::function<void(sd_bus_message* signal)>;

  /// Null when there is no bus. `lost` is called once, from within the loop, when it goes.
  [[nodiscard]] static std::unique_ptr<Bus> open(const Loop& loop, std::function<void()> lost);

  Bus(const Bus&) = delete;
  Bus& operator=(const Bus&) = delete;
  ~Bus();

  /// Signals of the object at `path` go to `receiver`, until forget().
  void receive(const std::string& path, Receiver receiver) {
    receivers_[path] = std::move(receiver);
  }
  void forget(const std::string& path) { receivers_.erase(path); }

  [[nodiscard]] sd_bus* get() const { return bus_.get(); }

  /// To be called after something was sent: what the connection waits for may have changed.
  void sent();

 private:
  using BusHandle = Handle<sd_bus, sd_bus_close_unref>;

  Bus(const Loop& loop, BusHandle bus, std::function<void()> lost);

  static int took(sd_bus_message* message, void* self, sd_bus_error* error);
  void process();

  const AvahiPoll& api_;
  std::function<void()> lost_;
  std::map<std::string, Receiver> receivers_;
  BusHandle bus_;
  Timer timer_;
  AvahiWatch* watch_;
};

}  // namespace onramp::avahi
