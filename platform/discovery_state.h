#pragma once

#include <functional>
#include <optional>
#include <string>

namespace onramp {

// Information about service discovery for diagnostic programs. The wizard does not use it. Main
// thread only.

/// Returns the reason why the system's service discovery cannot be used, or nothing when it can be
/// used. A browse may be started even while discovery cannot be used. It finds services as soon as
/// discovery works.
[[nodiscard]] std::optional<std::string> discoveryProblem();

/// Reports that a browse sees a service on one network interface and protocol, or no longer sees it
/// there. NetServiceBrowser merges all sightings of a service.
struct ServiceSighting {
  std::string name;       ///< as NetService::name()
  std::string type;       ///< as NetService::type()
  std::string domain;     ///< as NetService::domain()
  std::string interface;  ///< the network interface's name
  bool isIPv6 = false;    ///< seen by IPv6; otherwise by IPv4
  bool isGone = false;
};

/// Sets the function that is called on the main thread for each sighting in any browse. A null
/// `watch` ends the calls. The backend for macOS does not receive sightings and never calls
/// `watch`.
void watchSightings(std::function<void(const ServiceSighting&)> watch);

}  // namespace onramp
