#include "tests/recording/loop.h"

#include <condition_variable>
#include <deque>
#include <mutex>
#include <utility>

#include "platform/run_loop.h"
#include "tests/recording/front_end.h"

namespace onramp {

namespace {

struct Loop {
  std::mutex mutex;
  std::condition_variable changed;
  std::deque<std::function<void()>> posted;
  bool ended = false;
  bool modalAborted = false;
};

Loop& loop() {
  static Loop instance;
  return instance;
}

// Longer than any test may take. A wait that would never end stops after this time.
constexpr std::chrono::seconds kForever{120};

}  // namespace

namespace recording {

void resetLoop() {
  const std::lock_guard lock(loop().mutex);
  loop().posted.clear();
  loop().ended = false;
  loop().modalAborted = false;
}

void endLoop() {
  const std::lock_guard lock(loop().mutex);
  loop().ended = true;
  loop().changed.notify_all();
}

bool runPosted(const std::function<bool()>& done, std::chrono::duration<double> most) {
  const auto deadline = std::chrono::steady_clock::now() +
                        std::chrono::duration_cast<std::chrono::steady_clock::duration>(most);
  while (!done()) {
    std::unique_lock lock(loop().mutex);
    loop().changed.wait_until(lock, deadline, [] {
      return !loop().posted.empty() || loop().ended || loop().modalAborted;
    });
    if (loop().posted.empty()) {
      lock.unlock();
      return done();
    }
    const std::function<void()> action = std::move(loop().posted.front());
    loop().posted.pop_front();
    lock.unlock();
    action();
  }
  return true;
}

}  // namespace recording

void performOnMainThread(std::function<void()> action) {
  const std::lock_guard lock(loop().mutex);
  loop().posted.push_back(std::move(action));
  loop().changed.notify_all();
}

void runModalForWindow(const Window& window) {
  window.makeKeyAndOrderFront();
  const auto over = [] {
    const std::lock_guard lock(loop().mutex);
    return loop().modalAborted || loop().ended;
  };
  recording::runPosted(over, kForever);
  const std::lock_guard lock(loop().mutex);
  loop().modalAborted = false;
}

void abortModal() {
  const std::lock_guard lock(loop().mutex);
  loop().modalAborted = true;
  loop().changed.notify_all();
}

bool sleepOffMainThread(std::chrono::milliseconds duration) {
  // The pause ends once the main thread has called the test's `duringPause`.
  const auto passed = std::make_shared<bool>(false);
  performOnMainThread([duration, passed] {
    recording::FrontEnd& frontEnd = recording::FrontEnd::instance();
    frontEnd.pauses.push_back(static_cast<unsigned>(duration / std::chrono::seconds(1)));
    if (frontEnd.duringPause) frontEnd.duringPause(static_cast<int>(frontEnd.pauses.size()));
    const std::lock_guard lock(loop().mutex);
    *passed = true;
    loop().changed.notify_all();
  });
  std::unique_lock lock(loop().mutex);
  loop().changed.wait_for(lock, kForever, [&] { return *passed || loop().ended; });
  return !loop().ended;
}

}  // namespace onramp
