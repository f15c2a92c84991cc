#pragma once

#include <optional>
#include <string>

namespace onramp {

/// Asks the system's name services for the host `name` and returns the host's first IPv4 address in
/// dotted form. Returns nothing when the lookup fails or the host has no such address. If `name` is
/// itself an IPv4 address, the result is that address. Blocks for as long as the name services
/// take.
[[nodiscard]] std::optional<std::string> lookUpIPv4Address(const std::string& name);

}  // namespace onramp
