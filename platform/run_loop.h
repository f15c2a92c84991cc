#pragma once

#include <cstdint>
#include <functional>

#include "platform/outlets.h"

namespace onramp {

/// Runs `action` on the main thread, once, `seconds` from now. Main thread only.
void scheduleTimer(double seconds, std::function<void()> action);

/// Runs `action` on the main thread as soon as its loop comes to it, in every mode of the loop, the
/// modal one included. Callable from any thread.
void performOnMainThread(std::function<void()> action);

/// Shows `window`, makes it key and runs the main loop with it as the modal window; returns after
/// abortModal() or when the application is asked to terminate. Main thread only.
void runModalForWindow(const Window& window);

/// Ends the running modal loop; without one, nothing. Callable from any thread.
void abortModal();

/// Blocks the calling thread, never the main one, for `seconds`. False when the application was
/// asked to terminate meanwhile: the caller then ends what it is doing.
bool sleepOffMainThread(std::uint32_t seconds);

}  // namespace onramp
