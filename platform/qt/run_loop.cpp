#include "platform/run_loop.h"

#include <QCoreApplication>
#include <QEventLoop>
#include <QTimer>
#include <QWidget>
#include <atomic>
#include <utility>
#include <vector>

#include "platform/qt/focus.h"
#include "platform/qt/native.h"
#include "platform/termination.h"

namespace onramp {

namespace {

// Returns the running modal loops. The innermost is the last. Main thread only.
std::vector<QEventLoop*>& modalLoops() {
  static std::vector<QEventLoop*> loops;
  return loops;
}

// True from abortModal() until the modal loop has returned, or until the main thread has found that
// no loop is running. Meanwhile, the actions that were passed to performOnMainThread() do not
// run, because each of them could keep the loop from returning for seconds.
std::atomic<bool> isAborting = false;

}  // namespace

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
        if (isAborting && !modalLoops().empty()) {
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
  // Handles the clicks and key presses that arrived while the main thread was busy. The user meant
  // them for the page that is still shown, not for the next one.
  if (!isTerminating()) QCoreApplication::processEvents();
  modalLoops().pop_back();
  isAborting = false;
  if (const auto* const waited = qt::nativeOf<QWidget>(window)) qt::focusPage(*waited);
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
