#include "platform/avahi/loop.h"

#include <avahi-common/timeval.h>
#include <sys/eventfd.h>
#include <sys/time.h>
#include <unistd.h>

#include <algorithm>
#include <utility>

namespace onramp::avahi {

namespace {

void clearWakeUp(AvahiWatch*, int fd, AvahiWatchEvent, void*) {
  eventfd_t count = 0;
  eventfd_read(fd, &count);
}

}  // namespace

Loop::Loop() : poll_(avahi_simple_poll_new()), wakeUp_(eventfd(0, EFD_CLOEXEC | EFD_NONBLOCK)) {
  watch_ = api().watch_new(&api(), wakeUp_, AVAHI_WATCH_IN, clearWakeUp, nullptr);
}

Loop::~Loop() {
  api().watch_free(watch_);
  close(wakeUp_);
}

void Loop::post(std::function<void()> action) {
  const std::lock_guard lock(mutex_);
  const bool comesAnyway = !posted_.empty() || std::this_thread::get_id() == thread_;
  posted_.push_back(std::move(action));
  if (!comesAnyway) eventfd_write(wakeUp_, 1);
}

void Loop::run() {
  {
    const std::lock_guard lock(mutex_);
    thread_ = std::this_thread::get_id();
  }
  do {
    runPosted();
  } while (!quitting_ && avahi_simple_poll_iterate(poll_.get(), -1) == 0);
}

void Loop::runPosted() {
  while (true) {
    std::vector<std::function<void()>> actions;
    {
      const std::lock_guard lock(mutex_);
      actions.swap(posted_);
    }
    if (actions.empty()) return;
    for (const auto& action : actions)
      action();
  }
}

Timer::Timer(const Loop& loop, std::function<void()> action)
    : api_(loop.api()), action_(std::move(action)) {
  const auto fired = [](AvahiTimeout*, void* self) {
    auto& timer = *static_cast<Timer*>(self);
    timer.stop();
    timer.action_();
  };
  timeout_ = api_.timeout_new(&api_, nullptr, fired, this);
}

Timer::~Timer() {
  api_.timeout_free(timeout_);
}

void Timer::start(std::chrono::milliseconds wait) {
  timeval due{};
  const auto longest = std::chrono::milliseconds(std::chrono::hours(24 * 365));
  avahi_elapse_time(&due, static_cast<unsigned>(std::min(wait, longest).count()), 0);
  api_.timeout_update(timeout_, &due);
  running_ = true;
}

void Timer::ensure(std::chrono::milliseconds wait) {
  if (!running_) start(wait);
}

void Timer::stop() {
  api_.timeout_update(timeout_, nullptr);
  running_ = false;
}

}  // namespace onramp::avahi
