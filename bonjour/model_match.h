#pragma once

#include <string>
#include <vector>

#include "base/value.h"

namespace onramp {

/// Returns the model name of a device as the medium spells it: the record's USB manufacturer and
/// USB model, joined by one space even if either is empty.
[[nodiscard]] std::string modelTextOf(const Dictionary& device);

/// Returns whether `models` contains exactly the text that modelTextOf() returns for the device.
[[nodiscard]] bool isOneOf(const std::vector<std::string>& models, const Dictionary& device);

}  // namespace onramp
