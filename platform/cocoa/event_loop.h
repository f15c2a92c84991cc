#pragma once

namespace onramp::cocoa {

/// Posts an empty event to the application. AppKit checks only after an event whether a modal loop
/// must stop, so the loop might otherwise run until the next click or key. Main thread only.
void wakeEventLoop();

}  // namespace onramp::cocoa
