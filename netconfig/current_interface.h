#pragma once

#include <optional>
#include <string>

namespace onramp {

/// Returns the first IPv4 address of the interface named `interface_name`, or nothing when the
/// interface has none.
[[nodiscard]] std::optional<std::string> KSSCcurrentAddressWithInterfaceName(
    const std::string& interface_name);

/// Returns the name of the primary interface, which is the one that the preferred default route
/// uses. Returns nothing when there is no default route.
[[nodiscard]] std::optional<std::string> KSSCCopyCurrentInterfaceName();

}  // namespace onramp
