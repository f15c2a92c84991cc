#pragma once

#include <atomic>
#include <memory>
#include <thread>

#include "platform/avahi/handles.h"
#include "platform/posix/descriptor.h"

namespace onramp::avahi {

/// Lets the main thread run an event loop of sd-event beside its own: a thread waits until the
/// loop has something to do, and then asks the main thread to do it. The thread never touches the
/// loop itself, only polls its descriptor.
class LoopThread : public std::enable_shared_from_this<LoopThread> {
 public:
  /// Null when a descriptor or the thread cannot be had. The loop must outlive the result.
  [[nodiscard]] static std::shared_ptr<LoopThread> start(sd_event* loop);

  LoopThread(const LoopThread&) = delete;
  LoopThread& operator=(const LoopThread&) = delete;
  ~LoopThread();

  /// Makes the main thread run the loop soon. Needed when code outside of the loop has changed
  /// what the loop waits for. Main thread only.
  void runSoon();

 private:
  LoopThread(sd_event* loop, int descriptor, posix::Descriptor resume);

  void wait();
  void askMainThread();
  void runLoop();

  sd_event* loop_;
  int descriptor_;            ///< readable when the loop has something to do; the loop's own
  posix::Descriptor resume_;  ///< an eventfd: readable when the thread is to go on or to end
  bool isRunSoon_ = false;    ///< runSoon() has asked, and the main thread has not come to it
  std::atomic<bool> hasFailed_ = false;
  std::atomic<bool> isEnding_ = false;
  std::thread thread_;
};

}  // namespace onramp::avahi
