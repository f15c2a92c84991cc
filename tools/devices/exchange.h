#pragma once

#include <atomic>
#include <cstdint>
#include <optional>
#include <string>
#include <vector>

#include "base/value.h"

namespace onramp::devices {

/// One request for a device's active interface, and the reply.
struct Exchange {
  enum class Outcome {
    kValue,         ///< the reply has an integer
    kError,         ///< the reply has an error status
    kOtherType,     ///< the reply has no value of type INTEGER
    kUnreadable,    ///< the reply is malformed
    kOtherRequest,  ///< the reply's identifier is not the request's
    kRefused,       ///< the host reported that no program uses the port
    kLate,          ///< the reply came after the wizard would have stopped waiting
    kNone,          ///< no reply came
    kUnsent,        ///< nothing was sent, for example because there was no valid address or route
  };

  std::string address{};
  Outcome outcome = Outcome::kNone;
  std::vector<std::uint8_t> request{};
  std::vector<std::uint8_t> reply{};    ///< empty when none came
  std::optional<double> seconds{};      ///< from the request to the reply
  std::uint64_t errorStatus = 0;        ///< for kError; see RFC 1157 section 4.1.1
  std::optional<std::int64_t> value{};  ///< for kValue
  unsigned type = 0;                    ///< for kOtherType; the value's tag
  /// Whether the reply named a different SNMP object from the request. If so, the wizard would ask
  /// all later devices for the object that the reply named.
  bool changedQuestion = false;
};

/// The result of asking one device.
struct Answer {
  bool isWireless = false;  ///< by the wizard's rules
  bool isComplete = false;  ///< false when askDevice() was stopped
  double seconds = 0;       ///< how long the wizard's window would be unresponsive
  std::vector<Exchange> exchanges;

  /// Returns the exchange that best explains the answer: the last one with a value or, if none has
  /// a value, the first one with the most informative outcome. Returns null when there is no
  /// exchange. The answer owns the exchange.
  [[nodiscard]] const Exchange* telling() const;
};

/// Sends the device at `addresses`, an array of strings, the same requests as the wizard, in the
/// same order. Blocks for about 12 seconds for each silent address, or until `stopped` is set. Does
/// not change active_interface_table. May be called from any thread.
[[nodiscard]] Answer askDevice(const Array& addresses, const std::atomic<bool>& stopped);

/// Returns the name of an error status (RFC 1157 section 4.1.1), such as "noSuchName", or "error
/// status N" for an unknown one.
[[nodiscard]] std::string errorStatusName(std::uint64_t status);

}  // namespace onramp::devices
