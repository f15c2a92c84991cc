#pragma once

#include <optional>
#include <string>

namespace onramp {

/// Returns why the system's service discovery cannot be used, such as "Daemon not running"; nothing
/// when it can. A browse started meanwhile begins to find services once it can.
[[nodiscard]] std::optional<std::string> discoveryProblem();

}  // namespace onramp
