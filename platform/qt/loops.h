#pragma once

namespace onramp::qt {

/// Ends the main loop, every modal loop and every sleepOffMainThread() for good. Main thread only.
void endAllLoops();

}  // namespace onramp::qt
