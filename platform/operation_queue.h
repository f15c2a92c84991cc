#pragma once

#include <functional>
#include <system_error>
#include <thread>
#include <vector>

namespace onramp {

/// Runs each operation on a separate thread. The destructor waits until all operations have
/// finished, so everything that an operation refers to must exist until then.
class OperationQueue {
 public:
  OperationQueue() = default;
  OperationQueue(const OperationQueue&) = delete;
  OperationQueue& operator=(const OperationQueue&) = delete;
  ~OperationQueue() {
    for (std::thread& thread : threads_)
      thread.join();
  }

  /// Starts `operation`. Returns false, and does not run it, when the thread cannot be created.
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
