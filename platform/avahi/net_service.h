#pragma once

#include <string>

#include "platform/avahi/records.h"
#include "platform/net_service.h"

namespace onramp::avahi {

[[nodiscard]] NetServiceRef makeService(Instance instance);

/// Removes the closing dot: the seam's types and domains have one, the daemon's do not.
[[nodiscard]] inline std::string withoutClosingDot(std::string name) {
  if (name.ends_with('.')) name.pop_back();
  return name;
}

}  // namespace onramp::avahi
