#pragma once

#include <atomic>
#include <cstdint>
#include <optional>
#include <string>
#include <vector>

#include "base/value.h"

namespace onramp::devices {

/// One request for a device's active interface and what came back.
struct Exchange {
  enum class Outcome {
    kValue,         ///< an integer
    kError,         ///< an error status
    kOtherType,     ///< a value of another type
    kUnreadable,    ///< bytes that are no proper reply
    kOtherRequest,  ///< a reply to another request
    kRefused,       ///< the device's host said that nothing uses the port
    kLate,          ///< a reply, but after the wizard stopped waiting
    kNone,          ///< no reply
    kUnsent,        ///< no address, no socket, or no way there
  };

  std::string address{};
  Outcome outcome = Outcome::kNone;
  std::vector<std::uint8_t> request{};
  std::vector<std::uint8_t> reply{};    ///< empty when there is none
  std::optional<double> seconds{};      ///< from the request to the reply
  std::uint64_t errorStatus = 0;        ///< of kError (RFC 1157 section 4.1.1)
  std::optional<std::int64_t> value{};  ///< of kValue
  unsigned type = 0;                    ///< of kOtherType: the value's tag
  bool changedQuestion = false;         ///< the reply's name replaced the one asked for
};

/// What asking one device gave.
struct Answer {
  bool isWireless = false;  ///< as the wizard decides
  bool isComplete = false;  ///< false when asking was stopped
  double seconds = 0;       ///< that the wizard's window would stand still
  std::vector<Exchange> exchanges;

  /// The exchange that says most of why the answer is as it is; null when there is none.
  [[nodiscard]] const Exchange* telling() const;
};

/// Asks the device at `addresses` (strings) as the wizard does, with all its repetitions, and keeps
/// what is exchanged. Blocks for up to 12 seconds an address, or until `stopped` is set. The
/// wizard's own table of objects is not changed. Callable from any thread.
[[nodiscard]] Answer askDevice(const Array& addresses, const std::atomic<bool>& stopped);

/// The name of an error status, such as "noSuchName".
[[nodiscard]] std::string errorStatusName(std::uint64_t status);

}  // namespace onramp::devices
