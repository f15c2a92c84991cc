#pragma once

#include <functional>

namespace onramp {

/// On SIGINT (an interrupt from the terminal) or SIGTERM (a request to terminate), passes `action`
/// to performOnMainThread(). A second such signal terminates the program at once; the exit status
/// is 128 plus the signal's number. If the thread that waits for signals cannot be created, the
/// first signal terminates the program. Call this once, before the program starts other threads.
void onInterruption(std::function<void()> action);

}  // namespace onramp
