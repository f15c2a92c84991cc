#pragma once

#include <map>
#include <string>
#include <vector>

namespace onramp::recording {

/// SNMP agents without a wire, in place of the system's sockets: they answer at once what a test
/// says, and the wait for an answer that does not come takes no time.
class Agents {
 public:
  static constexpr int kSilent = -1;

  static Agents& instance();

  /// Back to the beginning: nobody answers.
  void reset();

  /// By dotted address the values of the answers to come; the last one goes for all further
  /// requests too.
  std::map<std::string, std::vector<int>> answers;

  std::vector<std::string> asked;  ///< the address of every request so far

  [[nodiscard]] int nextAnswer(const std::string& address);
};

}  // namespace onramp::recording
