#include "platform/run_loop.h"

#include <QCoreApplication>
#include <QEventLoop>
#include <QTimer>
#include <atomic>
#include <utility>
#include <vector>

#include "platform/qt/loops.h"
#include "platform/termination.h"

namespace onramp {

namespace {

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

bool isModal() {
  return !modalLoops().empty();
}

void endAllLoops() {
  beginTermination();
  QCoreApplication::exit(0);
}

}  // namespace qt

void scheduleTimer(std::chrono::milliseconds delay, std::function<void()> action) {
  QTimer::singleShot(delay, Qt::PreciseTimer, qApp, [action = std::move(action)] {
    if (!isTerminating()) action();
  });
}

void performOnMainThread(std::function<void()> action) {
  QMetaObject::invokeMethod(
      qApp,
      [action = std::move(action)]() mutable {
        if (isTerminating()) return;
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
  if (isTerminating()) return;
  QEventLoop loop;
  modalLoops().push_back(&loop);
  loop.exec();
  // Clicks and keys that waited while the main thread was busy were meant for what was shown then.
  if (!isTerminating()) QCoreApplication::processEvents();
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

}  // namespace onramp
