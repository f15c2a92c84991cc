#pragma once

#include <atomic>
#include <memory>
#include <thread>

#include "platform/avahi/handles.h"
#include "platform/posix/descriptor.h"

namespace onramp::avahi {

/// Lets the main thread run an event loop of sd-event in addition to its own: a thread waits until
/// the loop has something to do, and then asks the main thread to run it. The thread only polls the
/// loop's descriptor and never touches the loop.
class LoopThread : public std::enable_shared_from_this<LoopThread> {
 public:
  /// Null when the system has no descriptor or thread for it. The loop must outlive the result.
  [[nodiscard]] static std::shared_ptr<LoopThread> start(sd_event* loop);

  LoopThread(const LoopThread&) = delete;
  LoopThread& operator=(const LoopThread&) = delete;
  ~LoopThread();

  /// Makes the main thread run the loop soon. To be called after code outside the loop has changed
  /// what the loop waits for. Main thread only.
  void runSoon();

 private:
  LoopThread(sd_event* loop, int descriptor, posix::Descriptor resume);

  void wait();
  void askMainThread();
  void runLoop();

  sd_event* loop_;
  int descriptor_;            ///< the loop's; readable when the loop has something to do
  posix::Descriptor resume_;  ///< an eventfd; readable when the thread has to go on or to end
  bool isRunSoon_ = false;    ///< a run that runSoon() has asked for has not begun yet
  std::atomic<bool> hasFailed_ = false;
  std::atomic<bool> isEnding_ = false;
  std::thread thread_;
};

}  // namespace onramp::avahi
