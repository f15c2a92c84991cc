#pragma once

#include <optional>
#include <string>
#include <vector>

#include "tools/devices/device.h"

namespace onramp::devices {

/// Makes the application on the medium in the folder `path` the main bundle. Then uses the wizard's
/// own code to read the parts of the medium on which the wizard's search depends. `wanted` names
/// the models to search for; if it is empty, the search is for all models. Returns nothing, and
/// prints a message on standard error, if `path` is not a folder with an application, or if the
/// medium names no service type, has no models, or lacks a model in `wanted`.
[[nodiscard]] std::optional<Medium> readMedium(const std::string& path,
                                               const std::vector<std::string>& wanted);

}  // namespace onramp::devices
