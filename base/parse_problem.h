#pragma once

#include <cstddef>
#include <string>
#include <utility>

namespace onramp {

/// Why bytes cannot be read, and where. A reader notes the first one that it meets.
struct ParseProblem {
  std::string reason;      ///< a phrase such as "\";\" expected"; empty when nothing is wrong
  std::size_t offset = 0;  ///< in bytes of the file, or for a text of its UTF-8 form

  void note(std::string why, std::size_t where) {
    if (reason.empty()) *this = {std::move(why), where};
  }
};

}  // namespace onramp
