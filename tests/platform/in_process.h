#pragma once

#include <gtest/gtest.h>
#include <sys/resource.h>
#include <sys/wait.h>
#include <unistd.h>

#include <functional>

namespace onramp {

/// Calls `action` in a child process and returns the child's wait status, which is 0 if `action`
/// returned true. When `usage` is not null, stores there the resources that the child used.
inline int inProcess(const std::function<bool()>& action, rusage* usage = nullptr) {
  const pid_t process = fork();
  if (process == 0) _exit(action() ? 0 : 1);
  int status = -1;
  EXPECT_EQ(wait4(process, &status, 0, usage), process);
  return status;
}

}  // namespace onramp
