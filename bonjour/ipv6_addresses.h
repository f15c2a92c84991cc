#pragma once

#include <string>
#include <vector>

#include "platform/net_service.h"

namespace onramp {

/// Returns the resolved service's IPv6 addresses as texts, in the order of
/// NetService::addressing(). Returns an empty list when the service has none or is null. The wizard
/// itself uses IPv4 addresses only.
[[nodiscard]] std::vector<std::string> ipv6AddressesOf(const NetServiceRef& service);

}  // namespace onramp
