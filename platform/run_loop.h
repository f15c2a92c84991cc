#pragma once

#include <chrono>
#include <functional>

#include "platform/outlets.h"

namespace onramp {

/// Runs `action` once on the main thread after at least `delay`, even while a modal window is
/// shown. Timers run in the order of their due times. If the application terminates, `action` may
/// never run. Must be called on the main thread.
void scheduleTimer(std::chrono::milliseconds delay, std::function<void()> action);

/// Runs `action` once on the main thread, even while a modal window is shown. Actions never run
/// inside this function. They run in the order of the calls, except that abortModal() can delay
/// some of them. If the application terminates, `action` may never run. Callable from any thread.
void performOnMainThread(std::function<void()> action);

/// Shows `window` as a modal window, makes it the key window, and runs the main loop. Returns after
/// abortModal() has been called or when the application terminates. `window` must not be an empty
/// handle. Must be called on the main thread.
void runModalForWindow(const Window& window);

/// Ends the innermost call of runModalForWindow(), if there is one. Until that call has returned,
/// no action of performOnMainThread() runs. Callable from any thread.
void abortModal();

/// Blocks the calling thread for `duration` and then returns true. If the application terminates,
/// returns false at once, and the caller must let its thread finish. Must not be called on the main
/// thread.
bool sleepOffMainThread(std::chrono::milliseconds duration);

}  // namespace onramp
