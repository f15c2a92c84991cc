#pragma once

#include <chrono>
#include <functional>

namespace onramp::recording {

/// Drops the posted actions, and lets the loop run again after endLoop().
void resetLoop();

/// Ends the loop and wakes every waiting thread.
void endLoop();

/// Runs posted actions until `done` returns true. When no action is left, waits for one. Stops
/// waiting and returns when `most` has passed since the call, when the loop has ended or when
/// abortModal() has been called. Returns the last result of `done`.
bool runPosted(const std::function<bool()>& done, std::chrono::duration<double> most);

}  // namespace onramp::recording
