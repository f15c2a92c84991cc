#pragma once

#include <algorithm>
#include <chrono>
#include <vector>

/// The times of an operation, in nanoseconds.
class Samples {
 public:
  /// Runs `work` `times` times, and adds the mean time as one sample.
  template <typename Work>
  void measure(int times, Work work) {
    const auto start = std::chrono::steady_clock::now();
    for (int i = 0; i < times; ++i)
      work();
    const std::chrono::duration<double, std::nano> took = std::chrono::steady_clock::now() - start;
    samples_.push_back(took.count() / times);
  }

  [[nodiscard]] double median() const { return quantile(0.5); }

  /// Returns the sample at the quantile `part`, from 0 (the least sample) to 1 (the greatest).
  /// Between two samples, returns the lesser one. There must be at least one sample.
  [[nodiscard]] double quantile(double part) const {
    std::vector<double> sorted = samples_;
    std::sort(sorted.begin(), sorted.end());
    return sorted[static_cast<std::size_t>(part * static_cast<double>(sorted.size() - 1))];
  }

 private:
  std::vector<double> samples_;
};
