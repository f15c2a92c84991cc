#pragma once

#include <sys/types.h>

#include <optional>
#include <string>
#include <vector>

namespace onramp {

enum class Session {
  kOwn,  ///< a new session, so that the started program survives when the caller's terminal closes
  kShared,  ///< the caller's session; the program may be killed when the terminal closes
};

/// Starts the program at `executable` with `arguments`. The program starts with no signal blocked
/// or ignored. Returns the ID of the new process, which the caller must pass to waitForProcess().
/// Returns nothing when the program cannot be started.
[[nodiscard]] std::optional<pid_t> startProcess(const std::string& executable,
                                                const std::vector<std::string>& arguments,
                                                Session session);

/// Blocks until `process` exits. Returns the exit status, or nothing when a signal terminated the
/// process or the wait failed.
std::optional<int> waitForProcess(pid_t process);

}  // namespace onramp
