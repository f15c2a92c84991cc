#pragma once

#include <optional>
#include <string>
#include <vector>

#include "tools/devices/device.h"

namespace onramp::devices {

/// Makes the application on the medium in the folder `path` the running one and reads what its
/// search needs, with the wizard's own code. `wanted` names models to search for; empty for all of
/// them. Returns nothing, after a message on standard error, when the search could find nothing.
[[nodiscard]] std::optional<Medium> readMedium(const std::string& path,
                                               const std::vector<std::string>& wanted);

}  // namespace onramp::devices
