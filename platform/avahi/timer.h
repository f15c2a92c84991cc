#pragma once

#include <chrono>
#include <cstdint>
#include <functional>

#include "platform/avahi/handles.h"

namespace onramp::avahi {

/// Calls back once after a while, from within an event loop that it belongs to. It does nothing
/// when the system has no memory or descriptor for it; isUsable() then returns false.
class Timer {
 public:
  /// Timers of a loop that are due together are called in the order of their priorities, after all
  /// messages when it is SD_EVENT_PRIORITY_IDLE. The action may destroy everything but the timer.
  Timer(sd_event* loop, std::function<void()> action,
        std::int64_t priority = SD_EVENT_PRIORITY_NORMAL);
  Timer(const Timer&) = delete;
  Timer& operator=(const Timer&) = delete;
  ~Timer() = default;

  [[nodiscard]] bool isUsable() const { return source_ != nullptr; }

  /// Starts the wait, from the beginning if it is under way.
  void start(std::chrono::milliseconds wait);
  /// Starts the wait unless it is under way.
  void ensure(std::chrono::milliseconds wait);

 private:
  std::function<void()> action_;
  EventSource source_;
};

}  // namespace onramp::avahi
