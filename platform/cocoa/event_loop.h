#pragma once

namespace onramp::cocoa {

/// Posts an empty event, because a modal loop checks whether it was stopped only after it has
/// handled an event.
void wakeEventLoop();

}  // namespace onramp::cocoa
