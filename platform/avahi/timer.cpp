#include "platform/avahi/timer.h"

#include <ctime>
#include <utility>

namespace onramp::avahi {

namespace {

constexpr std::uint64_t kMicrosecond = 1;  // the best accuracy that sd-event offers

}  // namespace

Timer::Timer(sd_event* loop, std::function<void()> action, std::int64_t priority)
    : action_(std::move(action)) {
  const auto onTime = [](sd_event_source*, std::uint64_t, void* self) {
    static_cast<Timer*>(self)->action_();
    return 0;
  };
  sd_event_source* source = nullptr;
  if (sd_event_add_time_relative(loop, &source, CLOCK_MONOTONIC, 0, kMicrosecond, onTime, this) <
      0) {
    return;
  }
  source_.reset(source);
  sd_event_source_set_priority(source, priority);
  sd_event_source_set_enabled(source, SD_EVENT_OFF);
}

void Timer::start(std::chrono::milliseconds wait) {
  const std::chrono::microseconds microseconds = wait;
  sd_event_source_set_time_relative(source_.get(),
                                    static_cast<std::uint64_t>(microseconds.count()));
  sd_event_source_set_enabled(source_.get(), SD_EVENT_ONESHOT);
}

void Timer::stop() {
  sd_event_source_set_enabled(source_.get(), SD_EVENT_OFF);
}

void Timer::ensure(std::chrono::milliseconds wait) {
  if (sd_event_source_get_enabled(source_.get(), nullptr) == 0) start(wait);
}

}  // namespace onramp::avahi
