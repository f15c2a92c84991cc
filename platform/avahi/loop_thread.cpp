#include "platform/avahi/loop_thread.h"

#include <poll.h>
#include <sys/eventfd.h>

#include <cerrno>
#include <chrono>
#include <system_error>
#include <utility>

#include "platform/run_loop.h"

namespace onramp::avahi {

namespace {

// The pause before a retry. Without it, an operation that fails immediately would keep the
// processor busy.
constexpr std::chrono::seconds kPauseAfterFailure{1};

}  // namespace

std::shared_ptr<LoopThread> LoopThread::start(sd_event* loop) {
  const int descriptor = sd_event_get_fd(loop);
  posix::Descriptor resume(eventfd(0, EFD_CLOEXEC | EFD_NONBLOCK));
  if (descriptor < 0 || !resume) return nullptr;
  std::shared_ptr<LoopThread> self(new LoopThread(loop, descriptor, std::move(resume)));
  try {
    self->thread_ = std::thread([raw = self.get()] { raw->wait(); });
  } catch (const std::system_error&) {
    return nullptr;
  }
  self->runSoon();
  return self;
}

LoopThread::LoopThread(sd_event* loop, int descriptor, posix::Descriptor resume)
    : loop_(loop), descriptor_(descriptor), resume_(std::move(resume)) {}

LoopThread::~LoopThread() {
  if (!thread_.joinable()) return;
  isEnding_ = true;
  eventfd_write(resume_.get(), 1);
  thread_.join();
}

void LoopThread::runSoon() {
  if (std::exchange(isRunSoon_, true)) return;
  performOnMainThread([weak = weak_from_this()] {
    const auto self = weak.lock();
    if (!self) return;
    self->isRunSoon_ = false;
    self->runLoop();
  });
}

// Runs on `thread_`. After this function has asked the main thread to run the loop, it ignores the
// loop's descriptor until the main thread has run the loop.
void LoopThread::wait() {
  bool isAsking = false;
  while (!isEnding_) {
    pollfd descriptors[] = {{resume_.get(), POLLIN, 0}, {descriptor_, POLLIN, 0}};
    if (poll(descriptors, isAsking ? 1 : 2, -1) < 0) {
      if (errno != EINTR) std::this_thread::sleep_for(kPauseAfterFailure);
    } else if (descriptors[0].revents != 0) {
      eventfd_t count = 0;
      eventfd_read(resume_.get(), &count);
      isAsking = false;
      if (hasFailed_.exchange(false)) std::this_thread::sleep_for(kPauseAfterFailure);
    } else {
      isAsking = true;
      askMainThread();
    }
  }
}

void LoopThread::askMainThread() {
  performOnMainThread([weak = weak_from_this()] {
    const auto self = weak.lock();
    if (!self) return;
    self->runLoop();
    eventfd_write(self->resume_.get(), 1);
  });
}

// The last call of sd_event_run() finds nothing to do, but prepares the loop's descriptor for the
// next wait.
void LoopThread::runLoop() {
  int done = 0;
  do {
    done = sd_event_run(loop_, 0);
  } while (done > 0);
  if (done < 0) hasFailed_ = true;
}

}  // namespace onramp::avahi
