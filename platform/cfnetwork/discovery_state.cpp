#include "platform/discovery_state.h"

namespace onramp {

// The system starts its responder again whenever it ends.
std::optional<std::string> discoveryProblem() {
  return std::nullopt;
}

// The seam takes the watch by value, since a backend that has sightings keeps it.
// NOLINTNEXTLINE(performance-unnecessary-value-param)
void watchSightings(std::function<void(const ServiceSighting&)>) {}

}  // namespace onramp
