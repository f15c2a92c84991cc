#pragma once

#include <string>

namespace onramp::avahi {

/// Avahi writes types and domains without the closing dot that the seam's have.
[[nodiscard]] inline std::string withoutClosingDot(std::string name) {
  if (name.ends_with('.')) name.pop_back();
  return name;
}

}  // namespace onramp::avahi
