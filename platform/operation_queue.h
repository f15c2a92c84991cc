#pragma once

#include <functional>
#include <thread>
#include <vector>

namespace onramp {

/// Runs operations off the main thread, each on a thread of its own. Destruction waits for all of
/// them, so whatever an operation refers to has to outlive the queue, not the operation.
class OperationQueue {
 public:
  OperationQueue() = default;
  OperationQueue(const OperationQueue&) = delete;
  OperationQueue& operator=(const OperationQueue&) = delete;
  ~OperationQueue() {
    for (std::thread& thread : threads_)
      thread.join();
  }

  void addOperation(std::function<void()> operation) {
    threads_.emplace_back(std::move(operation));
  }

 private:
  std::vector<std::thread> threads_;
};

}  // namespace onramp
