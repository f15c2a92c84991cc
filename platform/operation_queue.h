#pragma once

#include <functional>
#include <system_error>
#include <thread>
#include <vector>

namespace onramp {

/// Runs operations off the main thread, each on its own thread. The destructor waits for the end of
/// all operations, so whatever an operation refers to must exist until the queue is destroyed.
class OperationQueue {
 public:
  OperationQueue() = default;
  OperationQueue(const OperationQueue&) = delete;
  OperationQueue& operator=(const OperationQueue&) = delete;
  ~OperationQueue() {
    for (std::thread& thread : threads_)
      thread.join();
  }

  /// Starts `operation`. Returns false, without running it, when the system provides no thread.
  [[nodiscard]] bool addOperation(std::function<void()> operation) {
    try {
      threads_.emplace_back(std::move(operation));
    } catch (const std::system_error&) {
      return false;
    }
    return true;
  }

 private:
  std::vector<std::thread> threads_;
};

}  // namespace onramp
