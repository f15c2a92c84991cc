#pragma once

namespace onramp::cocoa {

/// Makes every sleep off the main thread end: the application is about to terminate.
void wakeSleepersForTermination();

}  // namespace onramp::cocoa
