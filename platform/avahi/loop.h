#pragma once

#include <chrono>
#include <functional>
#include <mutex>
#include <thread>
#include <vector>

#include "platform/avahi/handles.h"

namespace onramp::avahi {

/// The loop of the one thread on which everything of the Avahi client happens. Calls to the daemon
/// block; this way they never block the main thread, and no lock is held while they do.
class Loop {
 public:
  Loop();
  Loop(const Loop&) = delete;
  Loop& operator=(const Loop&) = delete;
  ~Loop();

  /// Runs `action` on the loop's thread, outside of any callback of Avahi. Callable from any
  /// thread, the loop's own one included.
  void post(std::function<void()> action);

  /// Runs until quit() is called from within.
  void run();
  void quit() { quitting_ = true; }

  [[nodiscard]] const AvahiPoll& api() const { return *avahi_simple_poll_get(poll_.get()); }

 private:
  void runPosted();

  PollHandle poll_;
  int wakeUp_;
  AvahiWatch* watch_;
  bool quitting_ = false;

  std::mutex mutex_;
  std::thread::id thread_;
  std::vector<std::function<void()>> posted_;
};

/// Calls back once on the loop's thread after a while. That thread only.
class Timer {
 public:
  Timer(const Loop& loop, std::function<void()> action);
  Timer(const Timer&) = delete;
  Timer& operator=(const Timer&) = delete;
  ~Timer();

  /// Starts the wait, anew if it is under way.
  void start(std::chrono::milliseconds wait);
  /// Starts the wait unless it is under way.
  void ensure(std::chrono::milliseconds wait);
  void stop();

 private:
  const AvahiPoll& api_;
  std::function<void()> action_;
  AvahiTimeout* timeout_;
  bool running_ = false;
};

}  // namespace onramp::avahi
