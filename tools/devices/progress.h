#pragma once

#include <string>

namespace onramp::devices {

/// A progress line on the terminal, below the output that has been printed.
class Progress {
 public:
  Progress() = default;
  Progress(const Progress&) = delete;
  Progress& operator=(const Progress&) = delete;
  ~Progress() { clear(); }

  /// Returns whether standard error is a terminal. The line is shown only then.
  [[nodiscard]] static bool isShown();

  /// Replaces the line's text. Does nothing when isShown() is false.
  void show(const std::string& text);

  /// Removes the line.
  void clear();

  /// Removes the line and prints `text` on standard output.
  void print(const std::string& text);

 private:
  bool isThere_ = false;
};

}  // namespace onramp::devices
