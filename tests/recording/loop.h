#pragma once

#include <chrono>
#include <functional>

namespace onramp::recording {

/// Forgets posted actions and makes the loop run again after a terminate.
void resetLoop();

/// Wakes everything that waits, for good.
void endLoop();

/// Runs posted actions until `done` says so, the time is up or the loop is ended; whether `done`.
bool runPosted(const std::function<bool()>& done, std::chrono::duration<double> most);

}  // namespace onramp::recording
