#pragma once

#include <algorithm>
#include <chrono>
#include <cstdio>
#include <cstring>
#include <vector>

/// Measured durations of an operation, in nanoseconds.
class Samples {
 public:
  /// Runs `work` as often as `times` says, and adds the mean duration of a run as one sample.
  template <typename Work>
  void measure(int times, Work work) {
    const auto start = std::chrono::steady_clock::now();
    for (int i = 0; i < times; ++i)
      work();
    const std::chrono::duration<double, std::nano> took = std::chrono::steady_clock::now() - start;
    samples_.push_back(took.count() / times);
  }

  /// Prints the samples in seconds as a JSON array, in the order in which they were taken.
  void printJson() const {
    const char* separator = "[";
    for (const double sample : samples_) {
      std::printf("%s%.4g", separator, sample / 1e9);
      separator = ", ";
    }
    std::printf("]");
  }

  [[nodiscard]] double median() const { return quantile(0.5); }

  /// Returns the sample at the quantile `part`, from 0 (the smallest sample) to 1 (the largest). If
  /// the quantile is between two samples, returns the smaller one. There must be at least one
  /// sample.
  [[nodiscard]] double quantile(double part) const {
    std::vector<double> sorted = samples_;
    std::sort(sorted.begin(), sorted.end());
    return sorted[static_cast<std::size_t>(part * static_cast<double>(sorted.size() - 1))];
  }

 private:
  std::vector<double> samples_;
};

/// Returns whether the last argument is --json.
inline bool wantsJson(int argc, char** argv) {
  return argc > 1 && std::strcmp(argv[argc - 1], "--json") == 0;
}

/// Prints the samples of a benchmark and of its peer as a line of JSON: a Case of
/// bench/report/cases.py.
inline void printJson(const char* benchmark, const char* name, const char* peerName,
                      const Samples& ours, const Samples& peer) {
  std::printf(R"({"benchmark": "%s", "name": "%s", "peer_name": "%s", "unit": "s", "ours": )",
              benchmark, name, peerName);
  ours.printJson();
  std::printf(R"(, "peer": )");
  peer.printJson();
  std::printf("}\n");
}
