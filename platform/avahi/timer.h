#pragma once

#include <chrono>
#include <cstdint>
#include <functional>

#include "platform/avahi/handles.h"

namespace onramp::avahi {

/// Calls an action once after a given time, from inside an event loop. If the constructor cannot
/// get memory or a descriptor, the timer does nothing and isUsable() returns false.
class Timer {
 public:
  /// `priority` ranks events of `loop` that are due at the same time. With SD_EVENT_PRIORITY_IDLE,
  /// the timer runs after all waiting messages have been handled. `action` must not destroy the
  /// timer.
  Timer(sd_event* loop, std::function<void()> action,
        std::int64_t priority = SD_EVENT_PRIORITY_NORMAL);
  Timer(const Timer&) = delete;
  Timer& operator=(const Timer&) = delete;
  ~Timer() = default;

  [[nodiscard]] bool isUsable() const { return source_ != nullptr; }

  /// Starts the wait, or restarts it if it is already running.
  void start(std::chrono::milliseconds wait);
  /// Starts the wait, if it is not running yet.
  void ensure(std::chrono::milliseconds wait);
  /// Ends the wait without calling the action. Does nothing when the timer is not running.
  void stop();

 private:
  std::function<void()> action_;
  EventSource source_;
};

}  // namespace onramp::avahi
