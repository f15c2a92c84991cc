#pragma once

#include <string>
#include <vector>

#include "base/value.h"

namespace onramp {

/// Returns the name that the medium uses for the model of a device record: the USB manufacturer and
/// the USB model, joined by one space even if either is empty.
[[nodiscard]] std::string modelTextOf(const Dictionary& device);

/// Whether the result of modelTextOf() for the device is exactly equal to one of `models`.
[[nodiscard]] bool isOneOf(const std::vector<std::string>& models, const Dictionary& device);

}  // namespace onramp
