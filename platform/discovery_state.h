#pragma once

#include <functional>
#include <optional>
#include <string>

namespace onramp {

// What programs that explain service discovery ask for besides; the wizard does not use it. Main
// thread only.

/// Returns why the system's service discovery cannot be used; nothing when it can. A browse that
/// was started meanwhile finds services once it can be used.
[[nodiscard]] std::optional<std::string> discoveryProblem();

/// One place where a browse sees a service, or no longer sees it. Browsers fold these.
struct ServiceSighting {
  std::string name;       ///< as NetService::name()
  std::string type;       ///< as NetService::type()
  std::string domain;     ///< as NetService::domain()
  std::string interface;  ///< the network interface's name
  bool isIPv6 = false;    ///< whether it was announced by IPv6, otherwise by IPv4
  bool isGone = false;
};

/// Calls `watch` on the main thread for each sighting of all browses; null ends that. The backend
/// for macOS does not learn of sightings and never calls it.
void watchSightings(std::function<void(const ServiceSighting&)> watch);

}  // namespace onramp
