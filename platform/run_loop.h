#pragma once

#include <chrono>
#include <functional>

#include "platform/outlets.h"

namespace onramp {

/// Runs `action` once on the main thread, `delay` from now, in every mode of the main loop, the
/// modal one included. Timers run in the order of their due times. Must be called on the main
/// thread.
void scheduleTimer(std::chrono::milliseconds delay, std::function<void()> action);

/// Runs `action` once on the main thread, in every mode of the main loop. Actions run in the order
/// of the calls, never inside this function. Callable from any thread.
void performOnMainThread(std::function<void()> action);

/// Shows `window`, makes it key and runs the main loop with it as the modal window, until
/// abortModal() is called or the application is asked to terminate. Must be called on the main
/// thread.
void runModalForWindow(const Window& window);

/// Ends the running modal loop, if there is one, before any action that performOnMainThread() still
/// holds. Callable from any thread.
void abortModal();

/// Blocks the calling thread, which must not be the main thread, for `duration`. Returns false,
/// without waiting any longer, once the application terminates; the caller must then end its
/// thread.
bool sleepOffMainThread(std::chrono::milliseconds duration);

}  // namespace onramp
