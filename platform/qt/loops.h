#pragma once

namespace onramp::qt {

/// Ends the main loop, every modal one and every sleep off the main thread, for good. Main thread
/// only.
void endAllLoops();

}  // namespace onramp::qt
