#pragma once

#include <gtest/gtest.h>

#include <cerrno>
#include <cstddef>
#include <cstring>
#include <filesystem>
#include <initializer_list>
#include <iterator>
#include <set>
#include <string>
#include <vector>

namespace onramp::faults {

/// Which calls of the functions that system_calls.cpp replaces are to fail, and how.
struct Failure {
  std::size_t first = 0;  ///< the number of the first call that fails, counted from 1
  /// The error number of a call that fails. ENOMEM makes allocations fail and counts only these.
  /// Any other value makes the other functions fail and counts only those.
  int error = 0;
  bool isLasting = false;  ///< whether all later calls fail, too
};

/// Starts to count this thread's calls, and makes some of them fail as `failure` says.
void begin(const Failure& failure);

/// Lets all calls succeed again. Returns the names of the functions that were called since begin(),
/// in their order.
std::vector<std::string> end();

/// Calls `work` with its first call failing, then with its second, and so on until no call fails or
/// the test has failed. Does this for each of `errors`, first with single failures and then, except
/// for EINTR, with lasting failures. These also keep `work` from cleaning up, as if the process
/// were killed. After each run, expects that no descriptor has been left open, and calls `check`
/// with the name of the first call that failed and with the failure. The name is empty if no call
/// failed. Returns the names of all calls.
template <typename Work, typename Check>
std::set<std::string> failEveryCall(std::initializer_list<int> errors, const Work& work,
                                    const Check& check) {
  using std::filesystem::directory_iterator;
  const auto open = [] {
    return std::distance(directory_iterator("/proc/self/fd"), directory_iterator());
  };
  std::set<std::string> seen;
  for (const int error : errors) {
    for (const bool isLasting : {false, true}) {
      if (isLasting && error == EINTR) continue;  // interrupted calls are rightly repeated for ever
      std::string failed = "?";
      for (std::size_t number = 1; !failed.empty() && !testing::Test::HasFailure(); ++number) {
        const Failure failure{number, error, isLasting};
        const auto before = open();
        begin(failure);
        work();
        const std::vector<std::string> calls = end();
        seen.insert(calls.begin(), calls.end());
        failed = calls.size() < number ? "" : calls[number - 1];
        SCOPED_TRACE("call " + std::to_string(number) + ", " + failed +
                     (isLasting ? ", and later: " : ": ") + std::strerror(error));
        EXPECT_EQ(open(), before);
        check(failed, failure);
      }
    }
  }
  return seen;
}

}  // namespace onramp::faults
