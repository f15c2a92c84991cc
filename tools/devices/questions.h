#pragma once

#include <atomic>
#include <functional>
#include <memory>

#include "base/value.h"
#include "platform/operation_queue.h"
#include "tools/devices/exchange.h"

namespace onramp::devices {

/// Asks many devices at once, each on a separate thread. The wizard sends a device the same
/// requests, but asks one device after another.
class Questions {
 public:
  using Answered = std::function<void(Answer answer)>;

  Questions() = default;
  Questions(const Questions&) = delete;
  Questions& operator=(const Questions&) = delete;
  /// Calls stop() and waits for the threads to finish, which takes a fraction of a second.
  ~Questions();

  /// Starts to ask the device at `addresses`, an array of strings. Later calls `answered` with the
  /// answer on the main thread. If the system cannot start another thread, this call blocks until
  /// the device has been asked.
  void ask(const Array& addresses, Answered answered);

  /// Stops asking, permanently. The answers of devices that are still being asked, or are asked
  /// later, are incomplete.
  void stop() { *stopped_ = true; }

  /// Returns the number of devices for which `answered` has not been called yet.
  [[nodiscard]] std::size_t pending() const { return *pending_; }

 private:
  std::shared_ptr<std::atomic<bool>> stopped_ = std::make_shared<std::atomic<bool>>(false);
  std::shared_ptr<std::size_t> pending_ = std::make_shared<std::size_t>(0);  // main thread only
  OperationQueue queue_;
};

}  // namespace onramp::devices
