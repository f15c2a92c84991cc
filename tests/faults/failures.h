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

/// Says which calls fail, and how. Only functions that system_calls.cpp replaces can fail.
struct Failure {
  std::size_t first = 0;  ///< the number of the first call that fails, counted from 1
  /// The error number of a call that fails. With ENOMEM, only calls of `operator new` are counted
  /// and can fail; with any other value, only calls of the other replaced functions.
  int error = 0;
  bool isLasting = false;  ///< whether all later calls fail, too
};

/// Starts counting this thread's calls, and makes calls fail as `failure` says.
void begin(const Failure& failure);

/// Stops counting, and lets all calls succeed again. Returns the names of the functions called
/// since begin(), one for each counted call, in order.
std::vector<std::string> end();

/// Runs `work` again and again. In the first run, the first call fails; in the second run, the
/// second call; and so on until no call is left to fail or the test has failed. Does this for
/// each of `errors`, first with single failures, then with lasting failures (except for EINTR).
/// Lasting failures also keep `work` from cleaning up, as if the process were killed. After each
/// run, expects that no descriptor is left open. Then calls `check` with the name of the first call
/// that failed, and with the failure. The name is empty if no call failed. Returns the names of all
/// functions that were called and counted.
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
      if (isLasting && error == EINTR) continue;  // callers would rightly repeat the call for ever
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
