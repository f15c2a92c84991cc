#pragma once

namespace onramp {

// How a front end tells threads that sleep that the application is about to end. Each function is
// callable from any thread.

/// Whether beginTermination() was called.
[[nodiscard]] bool isTerminating();

/// Makes every sleepOffMainThread() return false, now and later.
void beginTermination();

}  // namespace onramp
