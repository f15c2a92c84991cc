#pragma once

#include <atomic>
#include <functional>
#include <memory>

#include "base/value.h"
#include "platform/operation_queue.h"
#include "tools/devices/exchange.h"

namespace onramp::devices {

/// Asks many devices at once, each on its own thread. The questions to each device are those of the
/// wizard, but the wizard asks one device after another.
class Questions {
 public:
  using Answered = std::function<void(Answer answer)>;

  Questions() = default;
  Questions(const Questions&) = delete;
  Questions& operator=(const Questions&) = delete;
  /// Calls stop() and waits for the threads, which then end soon.
  ~Questions();

  /// Asks the device at `addresses` (strings). Calls `answered` with the answer on the main thread.
  void ask(const Array& addresses, Answered answered);

  /// Stops asking. Devices that are being asked give incomplete answers.
  void stop() { *stopped_ = true; }

  /// Returns how many devices are being asked.
  [[nodiscard]] std::size_t pending() const { return *pending_; }

 private:
  std::shared_ptr<std::atomic<bool>> stopped_ = std::make_shared<std::atomic<bool>>(false);
  std::shared_ptr<std::size_t> pending_ = std::make_shared<std::size_t>(0);  // main thread only
  OperationQueue queue_;
};

}  // namespace onramp::devices
