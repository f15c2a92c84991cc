#pragma once

namespace onramp {

// A front end calls beginTermination() when the application terminates. Both functions can be
// called from any thread.

/// Returns whether beginTermination() has been called.
[[nodiscard]] bool isTerminating();

/// Makes every current and future call of sleepOffMainThread() return false.
void beginTermination();

}  // namespace onramp
