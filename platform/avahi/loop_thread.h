#pragma once

#include <atomic>
#include <memory>
#include <thread>

#include "platform/avahi/handles.h"
#include "platform/posix/descriptor.h"

namespace onramp::avahi {

/// Lets the main thread run an sd-event loop in addition to the main loop. A separate thread waits
/// until the sd-event loop has something to do, and then asks the main thread to run that loop. The
/// separate thread polls the loop's descriptor, but never touches the loop itself.
class LoopThread : public std::enable_shared_from_this<LoopThread> {
 public:
  /// Starts the thread for `loop`, which must outlive the result. Returns null when a descriptor
  /// or the thread cannot be created.
  [[nodiscard]] static std::shared_ptr<LoopThread> start(sd_event* loop);

  LoopThread(const LoopThread&) = delete;
  LoopThread& operator=(const LoopThread&) = delete;
  /// Stops the thread and waits for it to finish. This takes up to a second if the thread is
  /// pausing after a failure.
  ~LoopThread();

  /// Makes the main thread run the loop soon. Call this when code outside the loop has changed what
  /// the loop waits for. Main thread only.
  void runSoon();

 private:
  LoopThread(sd_event* loop, int descriptor, posix::Descriptor resume);

  void wait();
  void askMainThread();
  void runLoop();

  sd_event* loop_;
  int descriptor_;            ///< the loop's descriptor; readable when the loop has something to do
  posix::Descriptor resume_;  ///< an eventfd; readable when the thread must continue or stop
  bool isRunSoon_ = false;    ///< runSoon() has asked for a run that has not begun yet
  std::atomic<bool> hasFailed_ = false;
  std::atomic<bool> isEnding_ = false;
  std::thread thread_;
};

}  // namespace onramp::avahi
