#pragma once

#include <optional>
#include <string>

namespace onramp {

/// Asks the system's name services for the host `name` and returns the host's first IPv4 address in
/// dotted form, or nothing when the host has none. A dotted address is returned as it is. Blocks
/// for as long as the name services take.
[[nodiscard]] std::optional<std::string> lookUpIPv4Address(const std::string& name);

}  // namespace onramp
