#pragma once

namespace onramp::qt {

/// Returns whether a modal loop is running. Main thread only.
[[nodiscard]] bool isModal();

/// Ends the main loop, every modal loop and every sleepOffMainThread() for good. Main thread only.
void endAllLoops();

}  // namespace onramp::qt
