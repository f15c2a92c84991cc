#pragma once

namespace onramp::cocoa {

/// Ends every sleepOffMainThread(), because the application is about to terminate.
void wakeSleepersForTermination();

}  // namespace onramp::cocoa
