#pragma once

#include <optional>
#include <string>

namespace onramp {

/// The first IPv4 address of the interface named `interface_name`; nothing when it has none.
[[nodiscard]] std::optional<std::string> KSSCcurrentAddressWithInterfaceName(
    const std::string& interface_name);

/// The name of the primary interface, the one that the preferred default route leads through;
/// nothing when there is none.
[[nodiscard]] std::optional<std::string> KSSCCopyCurrentInterfaceName();

}  // namespace onramp
