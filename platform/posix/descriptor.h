#pragma once

#include <unistd.h>

#include <utility>

namespace onramp::posix {

/// Owns a file descriptor. The destructor closes it.
class Descriptor {
 public:
  /// Takes ownership of the descriptor `number`. A negative number, which failed system calls
  /// return, means no descriptor.
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

  /// Closes the descriptor now, if there is one. Returns false when the system reports an error,
  /// such as the loss of written data.
  bool close() {
    const int number = std::exchange(number_, -1);
    return number < 0 || ::close(number) == 0;
  }

 private:
  int number_;
};

}  // namespace onramp::posix
