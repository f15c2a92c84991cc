#include "platform/discovery_state.h"

namespace onramp {

// There is never a problem, because macOS restarts its responder whenever the responder ends.
std::optional<std::string> discoveryProblem() {
  return std::nullopt;
}

// The parameter is passed by value, because a backend that receives sightings stores it.
// NOLINTNEXTLINE(performance-unnecessary-value-param)
void watchSightings(std::function<void(const ServiceSighting&)>) {}

}  // namespace onramp
