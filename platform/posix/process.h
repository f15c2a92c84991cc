#pragma once

#include <sys/types.h>

#include <optional>
#include <string>
#include <vector>

namespace onramp {

enum class Session {
  kOwn,     ///< the program lives on when this one's terminal goes away
  kShared,  ///< the program belongs to this one
};

/// Starts the program at `executable`, in the default state of all signals. Its process, which has
/// to be waited for; nothing when it could not be started.
[[nodiscard]] std::optional<pid_t> startProcess(const std::string& executable,
                                                const std::vector<std::string>& arguments,
                                                Session session);

/// Blocks until `process` ends. Its exit status; nothing when a signal ended it.
std::optional<int> waitForProcess(pid_t process);

}  // namespace onramp
