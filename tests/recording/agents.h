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

/// Simulated SNMP agents, which replace the system's sockets. They answer at once with the values
/// that a test has set. A wait for an answer that never comes takes no time.
class Agents {
 public:
  static constexpr int kSilent = -1;
  static constexpr int kRefused = -2;  ///< the host answers that the port is closed

  using Bytes = std::vector<std::uint8_t>;

  static Agents& instance();

  /// Restores the initial state, in which no address answers.
  void reset() { *this = Agents(); }

  /// For each dotted address, the agent's answers in order. The last value also answers all further
  /// requests.
  std::map<std::string, std::vector<int>> answers;

  /// If this function is set, it returns the reply to every request, and `answers` is not used.
  /// When it returns nothing, the request stays unanswered.
  std::function<std::optional<Bytes>(const Bytes& request)> reply;

  bool socketsOpen = true;         ///< when false, no socket can be opened
  std::vector<std::string> asked;  ///< the address of every request so far
  std::uint16_t port = 0;          ///< the port of the latest request
  std::size_t room = 0;            ///< the size of the program's reply buffer, in bytes
  std::vector<std::chrono::nanoseconds> waits;  ///< the time limit of every wait

  /// Returns the next value of `address` in `answers`. Removes the value, except when it is the
  /// last one. Returns kSilent when the address has no values.
  [[nodiscard]] int nextAnswer(const std::string& address);
};

}  // namespace onramp::recording
