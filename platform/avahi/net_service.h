#pragma once

#include <string>

#include "platform/avahi/records.h"
#include "platform/net_service.h"

namespace onramp::avahi {

[[nodiscard]] NetServiceRef makeService(Instance instance);

/// The daemon has types and domains without the closing dot that the seam's have.
[[nodiscard]] inline std::string withoutClosingDot(std::string name) {
  if (name.ends_with('.')) name.pop_back();
  return name;
}

}  // namespace onramp::avahi
