#pragma once

#include <string>

#include "tools/check/report.h"

namespace onramp::check {

/// Checks the medium in the folder `root`, which must exist. As a side effect, makes the
/// application on that medium the main bundle, even if it is missing. From then on, the wizard's
/// own code reads that medium.
[[nodiscard]] Report checkMedium(const std::string& root);

}  // namespace onramp::check
