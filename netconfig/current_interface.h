#pragma once

#include <optional>
#include <string>

namespace onramp {

/// Returns the first IPv4 address of the interface named `interface_name`, in dotted form. Returns
/// nothing when the interface has no IPv4 address or does not exist, or when the system's
/// configuration cannot be read.
[[nodiscard]] std::optional<std::string> KSSCcurrentAddressWithInterfaceName(
    const std::string& interface_name);

/// Returns the name of the primary interface, the one with the preferred default route. Returns
/// nothing when there is no default route or when the system's configuration cannot be read.
[[nodiscard]] std::optional<std::string> KSSCCopyCurrentInterfaceName();

}  // namespace onramp
