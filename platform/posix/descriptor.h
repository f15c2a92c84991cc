#pragma once

#include <unistd.h>

#include <utility>

namespace onramp::posix {

/// Owns a file descriptor and closes it at destruction.
class Descriptor {
 public:
  /// Takes over `number`; a negative one, such as a failed call returns, owns nothing.
  explicit Descriptor(int number = -1) : number_(number) {}
  Descriptor(Descriptor&& other) noexcept : number_(std::exchange(other.number_, -1)) {}
  Descriptor& operator=(Descriptor&& other) noexcept {
    std::swap(number_, other.number_);
    return *this;
  }
  Descriptor(const Descriptor&) = delete;
  Descriptor& operator=(const Descriptor&) = delete;
  ~Descriptor() { close(); }

  explicit operator bool() const { return number_ >= 0; }
  [[nodiscard]] int get() const { return number_; }

  /// Closes it now. False when the system could not keep what was written.
  bool close() {
    const int number = std::exchange(number_, -1);
    return number < 0 || ::close(number) == 0;
  }

 private:
  int number_;
};

}  // namespace onramp::posix
