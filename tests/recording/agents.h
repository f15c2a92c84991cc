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

/// SNMP agents without a wire, in place of the system's sockets: they answer at once what a test
/// says, and waiting for an answer that does not come takes no time.
class Agents {
 public:
  static constexpr int kSilent = -1;
  static constexpr int kRefused = -2;  ///< nothing uses the port there

  using Bytes = std::vector<std::uint8_t>;

  static Agents& instance();

  /// Back to the beginning: nobody answers.
  void reset();

  /// The values that each dotted address answers with, in order. The last one answers all further
  /// requests too.
  std::map<std::string, std::vector<int>> answers;

  /// When set, makes the reply to every request, whatever its address; nothing stays silent.
  std::function<std::optional<Bytes>(const Bytes& request)> reply;

  bool socketsOpen = true;
  std::vector<std::string> asked;               ///< the address of every request so far
  std::uint16_t port = 0;                       ///< of the latest request
  std::size_t room = 0;                         ///< for the latest reply, in bytes
  std::vector<std::chrono::nanoseconds> waits;  ///< the longest that each wait might have taken

  [[nodiscard]] int nextAnswer(const std::string& address);
};

}  // namespace onramp::recording
