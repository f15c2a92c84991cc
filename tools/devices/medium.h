#pragma once

#include <optional>
#include <string>
#include <vector>

#include "tools/devices/device.h"

namespace onramp::devices {

/// Sets the main bundle to the application on the medium in the folder `path`, then reads what the
/// wizard's search needs, with the wizard's own code. `wanted` names the models to search for; when
/// it is empty, the search is for all models. Returns nothing, after a message on standard error,
/// when there is no medium in that folder, the medium lacks a model of `wanted`, or a search with
/// it cannot find any device.
[[nodiscard]] std::optional<Medium> readMedium(const std::string& path,
                                               const std::vector<std::string>& wanted);

}  // namespace onramp::devices
