#pragma once

#include <chrono>
#include <cstdint>
#include <functional>

#include "platform/avahi/handles.h"

namespace onramp::avahi {

/// Calls back once after a while, from within an event loop. When the system has no memory or
/// descriptor for it, it does nothing and isUsable() returns false.
class Timer {
 public:
  /// What is due in a loop at the same time happens in the order of the priorities. Timers of
  /// SD_EVENT_PRIORITY_IDLE come after all messages. The action must not destroy the timer.
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
