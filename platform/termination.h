#pragma once

namespace onramp {

// Connects a front end, which knows when the application terminates, with the threads that sleep in
// sleepOffMainThread(). Both functions are callable from any thread.

/// Returns whether beginTermination() has been called.
[[nodiscard]] bool isTerminating();

/// Makes every current and future call of sleepOffMainThread() return false.
void beginTermination();

}  // namespace onramp
