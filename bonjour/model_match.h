#pragma once

#include <string>
#include <vector>

#include "base/value.h"

namespace onramp {

/// Returns a device's model name in the form that the medium uses: the USB manufacturer and the USB
/// model from the record `device`, joined by one space even if either is empty.
[[nodiscard]] std::string modelTextOf(const Dictionary& device);

/// Returns whether `models` contains modelTextOf(device). The comparison is exact.
[[nodiscard]] bool isOneOf(const std::vector<std::string>& models, const Dictionary& device);

}  // namespace onramp
