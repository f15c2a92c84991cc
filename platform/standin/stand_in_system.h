#pragma once

#include <string>

namespace onramp {

/// Makes `version`, such as "10.9.5", the version of the macOS that this desktop stands in for.
/// Without it the environment's ONRAMP_SYSTEM_VERSION counts, and without that 10.15.7.
void setSystemVersion(std::string version);

}  // namespace onramp
