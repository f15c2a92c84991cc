#pragma once

#import <Foundation/Foundation.h>

#include <utility>

namespace onramp::cocoa {

/// Owns at most one reference to an Objective-C object.
template <typename Class>
class Retained {
 public:
  Retained() = default;

  /// Retains `object`, which may be nil.
  explicit Retained(Class* object) : object_([object retain]) {}

  /// Takes over the reference that alloc, new or copy returned to the caller, without retaining
  /// `object`.
  [[nodiscard]] static Retained adopt(Class* object) {
    Retained owner;
    owner.object_ = object;
    return owner;
  }

  Retained(const Retained& other) : Retained(other.object_) {}
  Retained(Retained&& other) noexcept : object_(std::exchange(other.object_, nil)) {}
  Retained& operator=(Retained other) noexcept {
    std::swap(object_, other.object_);
    return *this;
  }
  ~Retained() { [object_ release]; }

  /// Returns the object, or nil if there is none. The caller does not own the result.
  [[nodiscard]] Class* get() const { return object_; }

 private:
  Class* object_ = nil;
};

}  // namespace onramp::cocoa
