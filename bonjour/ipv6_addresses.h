#pragma once

#include <string>
#include <vector>

#include "platform/net_service.h"

namespace onramp {

/// Returns the IPv6 addresses of `service` as strings, in the order of NetService::addressing().
/// Returns an empty list when the service is null or unresolved, or has no IPv6 address. Only
/// onramp-devices uses this function; the wizard uses only IPv4 addresses.
[[nodiscard]] std::vector<std::string> ipv6AddressesOf(const NetServiceRef& service);

}  // namespace onramp
