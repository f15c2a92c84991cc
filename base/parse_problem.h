#pragma once

#include <cstddef>
#include <string>
#include <utility>

namespace onramp {

/// The reason why a file or a string cannot be parsed, and the place of the error.
struct ParseProblem {
  std::string reason;      ///< a phrase, such as `";" expected`; empty until note() is called
  std::size_t offset = 0;  ///< in bytes, from the start of the binary data or of the UTF-8 text

  /// Stores a reason and a place. Does nothing if an earlier call has already stored them.
  void note(std::string why, std::size_t where) {
    if (reason.empty()) *this = {std::move(why), where};
  }
};

}  // namespace onramp
