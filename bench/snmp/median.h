#pragma once

#include <algorithm>
#include <chrono>
#include <vector>

/// Repeated measurements of one thing, in nanoseconds.
class Samples {
 public:
  /// Runs `work` `times` times and keeps the mean time as one sample.
  template <typename Work>
  void measure(int times, Work work) {
    const auto start = std::chrono::steady_clock::now();
    for (int i = 0; i < times; ++i)
      work();
    const std::chrono::duration<double, std::nano> took = std::chrono::steady_clock::now() - start;
    samples_.push_back(took.count() / times);
  }

  [[nodiscard]] double median() const { return quantile(0.5); }

  /// Returns the value below which the fraction `part` of the samples lies. `part` is from 0 to 1.
  [[nodiscard]] double quantile(double part) const {
    std::vector<double> sorted = samples_;
    std::sort(sorted.begin(), sorted.end());
    return sorted[static_cast<std::size_t>(part * static_cast<double>(sorted.size() - 1))];
  }

 private:
  std::vector<double> samples_;
};
