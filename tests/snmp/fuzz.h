#pragma once

#include <cstdio>
#include <cstdlib>
#include <ctime>

/// Ends the fuzz run, which keeps the input, when `holds` is false.
inline void require(bool holds, const char* what) {
  if (holds) return;
  std::fprintf(stderr, "not so: %s\n", what);
  std::abort();
}

/// Runs `work` and requires that it takes no longer than any input of a few thousand bytes
/// justifies. Only the process's own time counts, so a busy machine does no harm.
template <typename Work>
void requireQuick(Work work) {
  const std::clock_t start = std::clock();
  work();
  require(std::clock() - start < CLOCKS_PER_SEC / 10, "a message takes less than 0.1 s");
}
