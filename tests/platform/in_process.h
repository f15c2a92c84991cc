#pragma once

#include <gtest/gtest.h>
#include <sys/resource.h>
#include <sys/wait.h>
#include <unistd.h>

#include <functional>

namespace onramp {

/// Calls `action` in a child process and returns the child's wait status, which is 0 if `action`
/// returned true. If `usage` is not null, stores the child's resource usage there.
inline int inProcess(const std::function<bool()>& action, rusage* usage = nullptr) {
  const pid_t process = fork();
  if (process == 0) _exit(action() ? 0 : 1);
  int status = -1;
  EXPECT_EQ(wait4(process, &status, 0, usage), process);
  return status;
}

}  // namespace onramp
