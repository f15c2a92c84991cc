#pragma once

#include <atomic>
#include <functional>
#include <memory>

#include "base/value.h"
#include "platform/operation_queue.h"
#include "tools/devices/exchange.h"

namespace onramp::devices {

/// Asks many devices at once, one thread for each. Each is asked exactly as the wizard asks it,
/// which asks one device after the other.
class Questions {
 public:
  using Answered = std::function<void(Answer answer)>;

  Questions() = default;
  Questions(const Questions&) = delete;
  Questions& operator=(const Questions&) = delete;
  /// Waits for the threads, which stop() makes end soon.
  ~Questions();

  /// Asks the device at `addresses` (strings); `answered` gets the answer on the main thread.
  void ask(const Array& addresses, Answered answered);

  /// Ends all asking; answers that are under way come incomplete.
  void stop() { *stopped_ = true; }

  /// How many devices are being asked.
  [[nodiscard]] std::size_t pending() const { return *pending_; }

 private:
  std::shared_ptr<std::atomic<bool>> stopped_ = std::make_shared<std::atomic<bool>>(false);
  std::shared_ptr<std::size_t> pending_ = std::make_shared<std::size_t>(0);  // main thread only
  OperationQueue queue_;
};

}  // namespace onramp::devices
