#pragma once

#include <string>

namespace onramp::devices {

/// A line on standard error that shows the progress, below the output printed so far. It is shown
/// only if standard error is a terminal.
class Progress {
 public:
  Progress() = default;
  Progress(const Progress&) = delete;
  Progress& operator=(const Progress&) = delete;
  ~Progress() { clear(); }

  /// Returns whether standard error is a terminal.
  [[nodiscard]] static bool isShown();

  /// Shows the line with `text`, replacing its previous text. Does nothing when isShown() is false.
  void show(const std::string& text);

  /// Removes the line if it is shown.
  void clear();

  /// Removes the line and prints `text` on standard output.
  void print(const std::string& text);

 private:
  bool isThere_ = false;
};

}  // namespace onramp::devices
