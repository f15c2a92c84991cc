#include "platform/termination.h"

#include <condition_variable>
#include <memory>
#include <mutex>

#include "platform/run_loop.h"

namespace onramp {

namespace {

struct Termination {
  std::mutex mutex;
  std::condition_variable changed;
  bool begun = false;
};

// Returns the only Termination object. The object is never destroyed, because a thread may still be
// sleeping while the process exits.
Termination& termination() {
  static Termination* const instance = std::make_unique<Termination>().release();
  return *instance;
}

}  // namespace

bool isTerminating() {
  const std::lock_guard lock(termination().mutex);
  return termination().begun;
}

void beginTermination() {
  {
    const std::lock_guard lock(termination().mutex);
    termination().begun = true;
  }
  termination().changed.notify_all();
}

bool sleepOffMainThread(std::chrono::milliseconds duration) {
  std::unique_lock lock(termination().mutex);
  return !termination().changed.wait_for(lock, duration, [] { return termination().begun; });
}

}  // namespace onramp
