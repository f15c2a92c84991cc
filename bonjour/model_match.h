#pragma once

#include <string>
#include <vector>

#include "base/value.h"

namespace onramp {

/// Returns the text that stands for the device's model on the medium: the record's USB manufacturer
/// and USB model with one blank between them, whether or not they are empty.
[[nodiscard]] std::string modelTextOf(const Dictionary& device);

/// Whether the device is one of `models`. Capitals and blanks count.
[[nodiscard]] bool isOneOf(const std::vector<std::string>& models, const Dictionary& device);

}  // namespace onramp
