#pragma once

#include <functional>
#include <optional>
#include <string>

namespace onramp {

// For diagnostic programs: information about service discovery. The wizard does not use this
// header. Call all functions on the main thread.

/// Returns the reason, in English, why the system's service discovery does not work. Returns
/// nothing when no reason is known. May block until the system answers. A search can be started
/// even while discovery does not work, and finds services once discovery works.
[[nodiscard]] std::optional<std::string> discoveryProblem();

/// A report that a NetServiceBrowser's search has seen a service on one network interface and
/// protocol, or no longer sees it there. (The browser's client is told only when a service is
/// first seen anywhere, and when it is no longer seen anywhere.) Services are not reported as gone
/// when the search ends, when the search stops covering their domain, or when discovery stops
/// working.
struct ServiceSighting {
  std::string name;       ///< see NetService::name()
  std::string type;       ///< see NetService::type()
  std::string domain;     ///< see NetService::domain()
  std::string interface;  ///< the network interface's name, or its number if the interface is gone
  bool isIPv6 = false;    ///< whether the protocol is IPv6 rather than IPv4
  bool isGone = false;    ///< whether the service is no longer seen on this interface and protocol
};

/// Makes all searches call `watch` on the main thread for each sighting. Replaces the function that
/// an earlier call set. An empty `watch` stops the calls. The backend for macOS never calls
/// `watch`, because macOS does not report the interface of a sighting.
void watchSightings(std::function<void(const ServiceSighting&)> watch);

}  // namespace onramp
