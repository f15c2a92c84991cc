#pragma once

namespace onramp {

/// A deleter for std::unique_ptr. Frees an object of a C library by calling `release`.
template <auto release>
struct ReleasedBy {
  template <typename Object>
  void operator()(Object* object) const {
    release(object);
  }
};

}  // namespace onramp
