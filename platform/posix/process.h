#pragma once

#include <sys/types.h>

#include <optional>
#include <string>
#include <vector>

namespace onramp {

enum class Session {
  kOwn,     ///< the program survives the end of this one's terminal
  kShared,  ///< the program ends with this one's terminal
};

/// Starts the program at `executable` with every signal in its default state and returns its
/// process, which must be waited for. Nothing when the program could not be started.
[[nodiscard]] std::optional<pid_t> startProcess(const std::string& executable,
                                                const std::vector<std::string>& arguments,
                                                Session session);

/// Blocks until `process` ends and returns its exit status; nothing when a signal ended it.
std::optional<int> waitForProcess(pid_t process);

}  // namespace onramp
