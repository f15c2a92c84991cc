#pragma once

#include <string>

#include "platform/avahi/records.h"
#include "platform/net_service.h"

namespace onramp::avahi {

/// Returns a service that has not been resolved yet.
[[nodiscard]] NetServiceRef makeService(Instance instance);

/// Removes the trailing dot, if there is one. Types and domains have a trailing dot in
/// platform/net_service.h, but not in the daemon's messages.
[[nodiscard]] inline std::string withoutClosingDot(std::string name) {
  if (name.ends_with('.')) name.pop_back();
  return name;
}

}  // namespace onramp::avahi
