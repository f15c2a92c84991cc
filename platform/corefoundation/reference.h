#pragma once

#include <CoreFoundation/CoreFoundation.h>

#include <utility>

namespace onramp::corefoundation {

/// Owns one reference to a Core Foundation object, or none.
template <typename Ref>
class Reference {
 public:
  Reference() = default;

  /// Takes ownership of the reference that a function with "Create" or "Copy" in its name has
  /// returned. Does not retain `object`, which may be null.
  explicit Reference(Ref object) : object_(object) {}

  /// Retains `object`, which the caller does not own and which may be null.
  [[nodiscard]] static Reference retaining(Ref object) {
    if (object) CFRetain(object);
    return Reference(object);
  }

  Reference(const Reference& other) : Reference(retaining(other.object_)) {}
  Reference(Reference&& other) noexcept : object_(std::exchange(other.object_, nullptr)) {}
  Reference& operator=(const Reference& other) { return *this = Reference(other); }
  Reference& operator=(Reference&& other) noexcept {
    std::swap(object_, other.object_);
    return *this;
  }
  ~Reference() {
    if (object_) CFRelease(object_);
  }

  /// Returns the object, or null when there is none. The caller does not own the result.
  [[nodiscard]] Ref get() const { return object_; }
  explicit operator bool() const { return object_ != nullptr; }

 private:
  Ref object_ = nullptr;
};

}  // namespace onramp::corefoundation
