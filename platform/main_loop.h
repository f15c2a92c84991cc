#pragma once

namespace onramp {

// The main loop of a program without windows. It runs what platform/run_loop.h schedules: timers,
// and actions for the main thread.

/// Runs the loop on the calling thread, which is the main one, until endMainLoop() is called.
void runMainLoop();

/// Lets runMainLoop() return after the action that is running. Main thread only.
void endMainLoop();

}  // namespace onramp
