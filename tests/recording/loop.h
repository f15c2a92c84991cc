#pragma once

#include <chrono>
#include <functional>

namespace onramp::recording {

/// Drops posted actions and lets the loop run again after a termination.
void resetLoop();

/// Ends the loop and wakes every waiting thread.
void endLoop();

/// Runs posted actions until `done` returns true, `most` has passed or the loop has ended. Returns
/// what `done` returned last.
bool runPosted(const std::function<bool()>& done, std::chrono::duration<double> most);

}  // namespace onramp::recording
