#pragma once

#include <optional>
#include <string>

namespace onramp {

/// The first IPv4 address of the host `name`, dotted, asked of the system's name services; nothing
/// when it has none. A dotted address stands for itself. Blocks as long as those services take.
[[nodiscard]] std::optional<std::string> lookUpIPv4Address(const std::string& name);

}  // namespace onramp
