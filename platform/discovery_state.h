#pragma once

#include <functional>
#include <optional>
#include <string>

namespace onramp {

// Information about service discovery for diagnostic programs. The wizard does not use this header.
// All functions must be called on the main thread.

/// Returns the reason, in English, why the system's service discovery cannot be used. Returns
/// nothing when no such reason is known. May block until the system answers. A search may be
/// started even while discovery cannot be used. The search finds services as soon as discovery
/// works.
[[nodiscard]] std::optional<std::string> discoveryProblem();

/// Reports that a NetServiceBrowser's search sees a service on one network interface and protocol,
/// or no longer sees the service there. The browser's client, in contrast, is told only of a
/// service's first sighting and of the loss of the last one. When the search ends, when it leaves a
/// domain, and when discovery stops working, the services that were seen until then are not
/// reported as gone.
struct ServiceSighting {
  std::string name;       ///< as NetService::name()
  std::string type;       ///< as NetService::type()
  std::string domain;     ///< as NetService::domain()
  std::string interface;  ///< the network interface's name, or its number if the interface is gone
  bool isIPv6 = false;    ///< true for a sighting by IPv6, false for one by IPv4
  bool isGone = false;    ///< true when the service is no longer seen there
};

/// Sets the function that is called on the main thread for each sighting in any search. Replaces
/// the earlier function. A null `watch` ends the calls. The backend for macOS never calls `watch`,
/// because macOS does not report the interface of a sighting.
void watchSightings(std::function<void(const ServiceSighting&)> watch);

}  // namespace onramp
