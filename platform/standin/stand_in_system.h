#pragma once

#include <string>

namespace onramp {

/// Sets the version of macOS that this desktop stands in for, such as "10.9.5". The default, also
/// for an empty `version`, is the environment variable ONRAMP_SYSTEM_VERSION, or 10.15.7 without
/// it.
void setSystemVersion(std::string version);

}  // namespace onramp
