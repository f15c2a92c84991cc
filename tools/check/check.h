#pragma once

#include <string>

#include "tools/check/report.h"

namespace onramp::check {

/// Checks the medium in the folder `root`, which must exist. As a side effect, makes the
/// application on that medium the main bundle, so that the wizard's own code then reads that
/// medium. If there is no application, uses the path that an application named kUsualName
/// (application.h) would have. May also change the version that
/// platform/system_version.h reports.
[[nodiscard]] Report checkMedium(const std::string& root);

}  // namespace onramp::check
