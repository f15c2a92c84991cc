#include "platform/avahi/bus.h"

#include <algorithm>
#include <chrono>
#include <cstdint>
#include <limits>
#include <utility>

namespace onramp::avahi {

std::unique_ptr<Bus> Bus::open(const Loop& loop, std::function<void()> lost) {
  sd_bus* opened = nullptr;
  if (sd_bus_open_system(&opened) < 0) return nullptr;
  return std::unique_ptr<Bus>(new Bus(loop, BusHandle(opened), std::move(lost)));
}

Bus::Bus(const Loop& loop, BusHandle bus, std::function<void()> lost)
    : api_(loop.api()),
      lost_(std::move(lost)),
      bus_(std::move(bus)),
      timer_(loop, [this] { process(); }) {
  sd_bus_add_filter(bus_.get(), nullptr, took, this);
  const auto ready = [](AvahiWatch*, int, AvahiWatchEvent, void* self) {
    static_cast<Bus*>(self)->process();
  };
  watch_ = api_.watch_new(&api_, sd_bus_get_fd(bus_.get()), AVAHI_WATCH_IN, ready, this);
  sent();
}

Bus::~Bus() {
  api_.watch_free(watch_);
}

int Bus::took(sd_bus_message* message, void* self, sd_bus_error*) {
  const char* const path = sd_bus_message_get_path(message);
  auto& receivers = static_cast<Bus*>(self)->receivers_;
  const auto receiver = path ? receivers.find(path) : receivers.end();
  if (receiver != receivers.end() && sd_bus_message_is_signal(message, nullptr, nullptr) > 0) {
    receiver->second(message);
  }
  return 0;
}

void Bus::process() {
  int more = 0;
  do {
    more = sd_bus_process(bus_.get(), nullptr);
  } while (more > 0);
  sent();
}

void Bus::sent() {
  const int events = sd_bus_get_events(bus_.get());
  if (events < 0) {
    api_.watch_update(watch_, AvahiWatchEvent{});
    timer_.stop();
    if (lost_) std::exchange(lost_, nullptr)();
    return;
  }
  // Both sides name the events as poll() does.
  api_.watch_update(watch_, static_cast<AvahiWatchEvent>(events));
  std::uint64_t due = 0;
  if (sd_bus_get_timeout(bus_.get(), &due) < 0 ||
      due == std::numeric_limits<std::uint64_t>::max()) {
    timer_.stop();
    return;
  }
  using std::chrono::steady_clock;
  const steady_clock::time_point at{std::chrono::microseconds(due)};
  timer_.start(std::max(std::chrono::milliseconds(0),
                        std::chrono::ceil<std::chrono::milliseconds>(at - steady_clock::now())));
}

}  // namespace onramp::avahi
