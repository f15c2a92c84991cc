#pragma once

namespace onramp {

// The main loop of a program without windows. The loop runs the actions that are passed to
// scheduleTimer() and performOnMainThread() in platform/run_loop.h. There are no modal loops.

/// Runs the loop on the calling thread, which must be the main thread, until endMainLoop() is
/// called.
void runMainLoop();

/// Makes runMainLoop() return soon after the running action has returned. Has no effect while the
/// loop is not running. Main thread only.
void endMainLoop();

}  // namespace onramp
