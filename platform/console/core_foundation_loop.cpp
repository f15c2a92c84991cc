#include <CoreFoundation/CoreFoundation.h>

#include <chrono>
#include <memory>
#include <utility>

#include "platform/corefoundation/reference.h"
#include "platform/main_loop.h"
#include "platform/run_loop.h"

namespace onramp {

namespace {

using corefoundation::Reference;
using Action = std::function<void()>;

// Adds a timer to the main run loop. After `seconds`, the timer runs `action` once and then
// destroys it. Does nothing when the system cannot create the timer. Callable from any thread.
void addTimer(double seconds, Action action) {
  const auto release = [](const void* info) {
    std::unique_ptr<const Action>(static_cast<const Action*>(info));
  };
  const auto fired = [](CFRunLoopTimerRef, void* info) { (*static_cast<Action*>(info))(); };
  auto owned = std::make_unique<Action>(std::move(action));
  CFRunLoopTimerContext context = {0, owned.get(), nullptr, release, nullptr};
  const Reference<CFRunLoopTimerRef> timer(CFRunLoopTimerCreate(
      kCFAllocatorDefault, CFAbsoluteTimeGetCurrent() + seconds, 0, 0, 0, fired, &context));
  if (!timer) return;
  owned.release();
  CFRunLoopAddTimer(CFRunLoopGetMain(), timer.get(), kCFRunLoopCommonModes);
}

bool hasEnded = false;  // main thread only

}  // namespace

void runMainLoop() {
  hasEnded = false;
  // CFRunLoopRunInMode() returns after it has handled a source, or after 0.1 seconds. If there
  // are neither sources nor timers, it returns at once. So this loop repeats the call until an
  // action has called endMainLoop().
  while (!hasEnded)
    CFRunLoopRunInMode(kCFRunLoopDefaultMode, 0.1, true);
}

void endMainLoop() {
  hasEnded = true;
}

void scheduleTimer(std::chrono::milliseconds delay, std::function<void()> action) {
  addTimer(std::chrono::duration<double>(delay).count(), std::move(action));
}

void performOnMainThread(std::function<void()> action) {
  addTimer(0, std::move(action));
  CFRunLoopWakeUp(CFRunLoopGetMain());
}

}  // namespace onramp
