#pragma once

namespace onramp {

// With these functions, a front end tells the threads that sleep in sleepOffMainThread() that the
// application terminates. Both are callable from any thread.

/// Returns whether beginTermination() has been called.
[[nodiscard]] bool isTerminating();

/// Makes every current and future call of sleepOffMainThread() return false.
void beginTermination();

}  // namespace onramp
