#pragma once

#include <functional>

namespace onramp {

/// Runs `action` by performOnMainThread() when the user interrupts the program from the terminal
/// (SIGINT) or the program is asked to terminate (SIGTERM). A second such signal ends the program
/// at once; the exit status is 128 plus the signal's number. If the system provides no thread, the
/// first signal ends the program. Call this once, before the program starts other threads.
void onInterruption(std::function<void()> action);

}  // namespace onramp
