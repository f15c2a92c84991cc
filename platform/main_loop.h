#pragma once

namespace onramp {

// The main loop of a program without windows. It runs the timers and actions that are scheduled by
// the functions in platform/run_loop.h.

/// Runs the loop on the calling thread, which is the main one, until endMainLoop() is called.
void runMainLoop();

/// Makes runMainLoop() return after the running action has ended. Main thread only.
void endMainLoop();

}  // namespace onramp
