#pragma once

#include <optional>
#include <string>
#include <vector>

#include "tools/devices/device.h"

namespace onramp::devices {

/// Reads the parts of a medium on which the wizard's search depends, with the wizard's own code.
/// `path` is the folder that contains the wizard's application, which becomes the main bundle.
/// `wanted` names the models to search for; if it is empty, the search is for all models. Returns
/// nothing, and prints a message on standard error, if `path` is not a folder with an application,
/// or if the medium names no service type, has no models, or lacks one of the `wanted` models.
[[nodiscard]] std::optional<Medium> readMedium(const std::string& path,
                                               const std::vector<std::string>& wanted);

}  // namespace onramp::devices
