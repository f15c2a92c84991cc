#pragma once

#include <string>

#include "tools/check/report.h"

namespace onramp::check {

/// Checks the medium in the folder `root`, which exists. Makes the application that lies on it the
/// running one, so that the wizard's own code reads this medium from then on.
[[nodiscard]] Report checkMedium(const std::string& root);

}  // namespace onramp::check
