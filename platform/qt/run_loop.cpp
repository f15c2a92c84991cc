#include "platform/run_loop.h"

#include <QCoreApplication>
#include <QEventLoop>
#include <QTimer>
#include <atomic>
#include <chrono>
#include <cmath>
#include <condition_variable>
#include <mutex>
#include <utility>
#include <vector>

#include "platform/qt/loops.h"

namespace onramp {

namespace {

struct Termination {
  std::mutex mutex;
  std::condition_variable changed;
  bool asked = false;
};

Termination& termination() {
  static Termination instance;
  return instance;
}

// The modal loops that run now, the innermost last. Main thread only.
std::vector<QEventLoop*>& modalLoops() {
  static std::vector<QEventLoop*> loops;
  return loops;
}

// Set from the request for the end of a modal loop until it has ended. What else waits for the main
// thread may keep it for seconds each, so it waits until then.
std::atomic<bool> isAborting = false;

}  // namespace

namespace qt {

bool isTerminating() {
  const std::lock_guard lock(termination().mutex);
  return termination().asked;
}

bool isModal() {
  return !modalLoops().empty();
}

void endAllLoops() {
  {
    const std::lock_guard lock(termination().mutex);
    termination().asked = true;
  }
  termination().changed.notify_all();
  QCoreApplication::exit(0);
}

}  // namespace qt

void scheduleTimer(double seconds, std::function<void()> action) {
  const std::chrono::milliseconds delay(std::llround(seconds * 1000));
  QTimer::singleShot(delay, Qt::PreciseTimer, qApp, [action = std::move(action)] {
    if (!qt::isTerminating()) action();
  });
}

void performOnMainThread(std::function<void()> action) {
  QMetaObject::invokeMethod(
      qApp,
      [action = std::move(action)]() mutable {
        if (qt::isTerminating()) return;
        if (isAborting && qt::isModal()) {
          performOnMainThread(std::move(action));
        } else {
          action();
        }
      },
      Qt::QueuedConnection);
}

void runModalForWindow(const Window& window) {
  window.makeKeyAndOrderFront();
  if (qt::isTerminating()) return;
  QEventLoop loop;
  modalLoops().push_back(&loop);
  loop.exec();
  // Clicks and keys that waited while the main thread was busy were meant for what was shown then.
  if (!qt::isTerminating()) QCoreApplication::processEvents();
  modalLoops().pop_back();
  isAborting = false;
}

void abortModal() {
  isAborting = true;
  const auto abort = [] {
    if (modalLoops().empty()) {
      isAborting = false;
    } else {
      modalLoops().back()->quit();
    }
  };
  QMetaObject::invokeMethod(qApp, abort, Qt::QueuedConnection);
}

bool sleepOffMainThread(std::uint32_t seconds) {
  std::unique_lock lock(termination().mutex);
  return !termination().changed.wait_for(lock, std::chrono::seconds(seconds),
                                         [] { return termination().asked; });
}

}  // namespace onramp
