#pragma once

namespace onramp {

/// A deleter for std::unique_ptr that gives a C library's object back by calling `release`.
template <auto release>
struct ReleasedBy {
  template <typename Object>
  void operator()(Object* object) const {
    release(object);
  }
};

}  // namespace onramp
