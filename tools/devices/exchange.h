#pragma once

#include <atomic>
#include <cstdint>
#include <optional>
#include <string>
#include <vector>

#include "base/value.h"

namespace onramp::devices {

/// One request for a device's active interface, and its reply.
struct Exchange {
  enum class Outcome {
    kValue,         ///< an integer
    kError,         ///< an error status
    kOtherType,     ///< a value of another type
    kUnreadable,    ///< bytes that are not a proper reply
    kOtherRequest,  ///< a reply to another request
    kRefused,       ///< the host reported that no program uses the port
    kLate,          ///< a reply that came after the wizard would have stopped waiting
    kNone,          ///< no reply
    kUnsent,        ///< nothing was sent: no valid address, socket or route
  };

  std::string address{};
  Outcome outcome = Outcome::kNone;
  std::vector<std::uint8_t> request{};
  std::vector<std::uint8_t> reply{};    ///< empty when there is none
  std::optional<double> seconds{};      ///< from the request to the reply
  std::uint64_t errorStatus = 0;        ///< of kError (RFC 1157 section 4.1.1)
  std::optional<std::int64_t> value{};  ///< of kValue
  unsigned type = 0;                    ///< of kOtherType: the value's tag
  /// The reply named another object, which replaced the one to ask later devices for.
  bool changedQuestion = false;
};

/// The result of asking one device.
struct Answer {
  bool isWireless = false;  ///< as the wizard decides
  bool isComplete = false;  ///< false when the asking was stopped
  double seconds = 0;       ///< how long the wizard's window would stand still
  std::vector<Exchange> exchanges;

  /// Returns the exchange that best explains the answer; null when there is no exchange.
  [[nodiscard]] const Exchange* telling() const;
};

/// Asks the device at `addresses` (strings) exactly as the wizard does, repetitions included. The
/// answer holds all exchanges. Blocks for about 12 seconds per silent address, or until `stopped`
/// is set.
/// Does not change the wizard's own table of objects. Callable from any thread.
[[nodiscard]] Answer askDevice(const Array& addresses, const std::atomic<bool>& stopped);

/// Returns the name of an error status, such as "noSuchName".
[[nodiscard]] std::string errorStatusName(std::uint64_t status);

}  // namespace onramp::devices
