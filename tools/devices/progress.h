#pragma once

#include <string>

namespace onramp::devices {

/// A line on the terminal that says how far things are, below what has been printed.
class Progress {
 public:
  Progress() = default;
  Progress(const Progress&) = delete;
  Progress& operator=(const Progress&) = delete;
  ~Progress() { clear(); }

  /// Whether there is a terminal to show it on.
  [[nodiscard]] static bool isShown();

  /// Replaces the line. Without a terminal, nothing.
  void show(const std::string& text);

  /// Takes the line away.
  void clear();

  /// Prints `text` on standard output in the line's place.
  void print(const std::string& text);

 private:
  bool isThere_ = false;
};

}  // namespace onramp::devices
