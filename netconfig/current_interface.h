#pragma once

#include <optional>
#include <string>

namespace onramp {

/// Returns the first IPv4 address of the interface named `interface_name`, in dotted form. Returns
/// nothing when the dynamic store (platform/dynamic_store.h) has no IPv4 address for the interface,
/// for example because the interface is down, and when the store cannot be read.
[[nodiscard]] std::optional<std::string> KSSCcurrentAddressWithInterfaceName(
    const std::string& interface_name);

/// Returns the name of the primary interface, the one with the preferred default route. Returns
/// nothing when there is no usable default route, and when the store cannot be read.
[[nodiscard]] std::optional<std::string> KSSCCopyCurrentInterfaceName();

}  // namespace onramp
