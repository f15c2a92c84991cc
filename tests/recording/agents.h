#pragma once

#include <chrono>
#include <cstddef>
#include <cstdint>
#include <functional>
#include <map>
#include <optional>
#include <string>
#include <vector>

#include "platform/datagram_socket.h"

namespace onramp::recording {

/// SNMP agents that replace the system's sockets. They answer at once with the values that a test
/// has set. Waiting for an answer that does not come takes no time.
class Agents {
 public:
  static constexpr int kSilent = -1;
  static constexpr int kRefused = -2;  ///< the host answers that the port is closed

  using Bytes = std::vector<std::uint8_t>;

  static Agents& instance();

  /// Returns to the initial state, in which no address answers.
  void reset() { *this = Agents(); }

  /// The values that each dotted address answers with, in order. The last value answers all further
  /// requests too.
  std::map<std::string, std::vector<int>> answers;

  /// When set, returns the reply to every request, whatever its address. When it returns nothing,
  /// the request stays unanswered.
  std::function<std::optional<Bytes>(const Bytes& request)> reply;

  bool socketsOpen = true;
  std::vector<std::string> asked;               ///< the address of every request so far
  std::uint16_t port = 0;                       ///< of the latest request
  std::size_t room = 0;                         ///< of the buffer for the latest reply, in bytes
  std::vector<std::chrono::nanoseconds> waits;  ///< the time limit of every wait

  [[nodiscard]] int nextAnswer(const std::string& address);
};

}  // namespace onramp::recording
