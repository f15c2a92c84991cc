#include "platform/discovery_state.h"

namespace onramp {

// Always returns nothing, because macOS restarts mDNSResponder, its program for service discovery,
// whenever that program exits.
std::optional<std::string> discoveryProblem() {
  return std::nullopt;
}

// Takes the function by value, because the backend for Linux stores the function.
// NOLINTNEXTLINE(performance-unnecessary-value-param)
void watchSightings(std::function<void(const ServiceSighting&)>) {}

}  // namespace onramp
