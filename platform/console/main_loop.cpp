#include "platform/main_loop.h"

#include <chrono>
#include <condition_variable>
#include <deque>
#include <map>
#include <memory>
#include <mutex>
#include <utility>

#include "platform/run_loop.h"

namespace onramp {

namespace {

using Clock = std::chrono::steady_clock;

struct MainLoop {
  std::mutex mutex;
  std::condition_variable posted;
  std::deque<std::function<void()>> actions;
  // The members below are used only on the main thread.
  std::multimap<Clock::time_point, std::function<void()>> timers;
  bool ended = false;
};

// Returns the program's only main loop. It is never destroyed, because other threads may still post
// actions while the process exits.
MainLoop& mainLoop() {
  static MainLoop* const instance = std::make_unique<MainLoop>().release();
  return *instance;
}

// Waits until an action has been posted or a timer is due. Returns the posted action or the timer's
// action.
std::function<void()> nextAction() {
  MainLoop& loop = mainLoop();
  std::unique_lock lock(loop.mutex);
  const auto hasAction = [&loop] { return !loop.actions.empty(); };
  if (loop.timers.empty()) {
    loop.posted.wait(lock, hasAction);
  } else {
    loop.posted.wait_until(lock, loop.timers.begin()->first, hasAction);
  }
  if (!hasAction()) return std::move(loop.timers.extract(loop.timers.begin()).mapped());
  std::function<void()> action = std::move(loop.actions.front());
  loop.actions.pop_front();
  // Queues a due timer's action, because the timer would otherwise wait for as long as further
  // actions keep arriving.
  if (!loop.timers.empty() && loop.timers.begin()->first <= Clock::now()) {
    loop.actions.push_back(std::move(loop.timers.extract(loop.timers.begin()).mapped()));
  }
  return action;
}

}  // namespace

void runMainLoop() {
  mainLoop().ended = false;
  while (!mainLoop().ended)
    nextAction()();
}

void endMainLoop() {
  mainLoop().ended = true;
}

void scheduleTimer(std::chrono::milliseconds delay, std::function<void()> action) {
  mainLoop().timers.emplace(Clock::now() + delay, std::move(action));
}

void performOnMainThread(std::function<void()> action) {
  const std::lock_guard lock(mainLoop().mutex);
  mainLoop().actions.push_back(std::move(action));
  mainLoop().posted.notify_one();
}

}  // namespace onramp
