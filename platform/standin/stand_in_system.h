#pragma once

#include <string>

namespace onramp {

/// Sets the version of macOS, such as "10.9.5", that is reported as the running system's. If
/// `version` is empty or was never set, the environment variable ONRAMP_SYSTEM_VERSION gives the
/// version. If this variable is empty or not set, the version is 10.15.7.
void setSystemVersion(std::string version);

}  // namespace onramp
