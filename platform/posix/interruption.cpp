#include "platform/interruption.h"

#include <pthread.h>
#include <signal.h>
#include <unistd.h>

#include <system_error>
#include <thread>
#include <utility>

#include "platform/run_loop.h"

namespace onramp {

namespace {

constexpr int kExitOfSignals = 128;  // in exit statuses, shells add this to the signal's number

}  // namespace

void onInterruption(std::function<void()> action) {
  sigset_t signals;
  sigemptyset(&signals);
  sigaddset(&signals, SIGINT);
  sigaddset(&signals, SIGTERM);
  // Every thread that starts later inherits this mask, so only the thread that calls sigwait()
  // receives the signals.
  pthread_sigmask(SIG_BLOCK, &signals, nullptr);
  const auto wait = [signals, action = std::move(action)]() mutable {
    int number = 0;
    sigwait(&signals, &number);
    performOnMainThread(std::move(action));
    sigwait(&signals, &number);
    _exit(kExitOfSignals + number);
  };
  try {
    std::thread(wait).detach();
  } catch (const std::system_error&) {
    pthread_sigmask(SIG_UNBLOCK, &signals, nullptr);
  }
}

}  // namespace onramp
