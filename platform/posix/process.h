#pragma once

#include <sys/types.h>

#include <optional>
#include <string>
#include <vector>

namespace onramp {

enum class Session {
  kOwn,  ///< a new session, so that the started program survives the end of the caller's terminal
  kShared,  ///< the caller's session, so that the started program may end with the terminal
};

/// Starts the program at `executable` with `arguments`. The program starts with no signal blocked
/// or ignored. Returns the ID of the new process, which the caller must pass to waitForProcess().
/// Returns nothing when the program cannot be started.
[[nodiscard]] std::optional<pid_t> startProcess(const std::string& executable,
                                                const std::vector<std::string>& arguments,
                                                Session session);

/// Blocks until `process` ends. Returns the exit status, or nothing when a signal ended the process
/// or the wait failed.
std::optional<int> waitForProcess(pid_t process);

}  // namespace onramp
