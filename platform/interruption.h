#pragma once

#include <functional>

namespace onramp {

/// Runs `action` on the main thread, by performOnMainThread(), when the user interrupts the program
/// from the terminal or somebody asks it to end. A second interruption ends the program at once.
/// Call it once, before the program has other threads.
void onInterruption(std::function<void()> action);

}  // namespace onramp
