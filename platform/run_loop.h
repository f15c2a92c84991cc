#pragma once

#include <chrono>
#include <functional>

#include "platform/outlets.h"

namespace onramp {

/// Runs `action` once on the main thread, no earlier than `delay` from now, even while a modal
/// window is shown. Timers run in the order of their due times. When the application terminates,
/// `action` may never run. Must be called on the main thread.
void scheduleTimer(std::chrono::milliseconds delay, std::function<void()> action);

/// Runs `action` once on the main thread, even while a modal window is shown. Actions never run
/// inside this function. They run in the order of the calls, except those that abortModal() holds
/// back. When the application terminates, `action` may never run. Callable from any thread.
void performOnMainThread(std::function<void()> action);

/// Shows `window`, which must not be an empty handle, makes it the key window, and runs the main
/// loop with `window` as the modal window. Returns after abortModal() has been called or when the
/// application terminates. Must be called on the main thread.
void runModalForWindow(const Window& window);

/// Ends the innermost running modal loop, if there is one. Until that loop has ended, actions of
/// performOnMainThread() that have not run yet are held back. Callable from any thread.
void abortModal();

/// Blocks the calling thread, which must not be the main thread, for `duration`. When the
/// application terminates, returns false at once; the caller must then end its thread. Returns true
/// otherwise.
bool sleepOffMainThread(std::chrono::milliseconds duration);

}  // namespace onramp
