#pragma once

#include <string>

#include "tools/check/report.h"

namespace onramp::check {

/// Checks the medium in the folder `root`, which must exist. Sets the main bundle to the
/// application on that medium, or to the path at which it is missing. The wizard's own code reads
/// that medium from then on.
[[nodiscard]] Report checkMedium(const std::string& root);

}  // namespace onramp::check
