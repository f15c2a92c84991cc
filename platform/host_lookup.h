#pragma once

#include <optional>
#include <string>

namespace onramp {

/// Asks the system's name services for the host `name` and returns the host's first IPv4 address in
/// dotted form. Returns nothing when the lookup fails or the host has no IPv4 address. If `name` is
/// itself an IPv4 address, returns that address. Blocks until the lookup succeeds or fails.
[[nodiscard]] std::optional<std::string> lookUpIPv4Address(const std::string& name);

}  // namespace onramp
