#pragma once

#include <string>

namespace onramp {

/// Sets the version of macOS, such as "10.9.5", that the functions of platform/system_version.h
/// return. If this version is empty or was never set, those functions return the version in the
/// environment variable ONRAMP_SYSTEM_VERSION. If that variable is empty or not set, they return
/// 10.15.7.
void setSystemVersion(std::string version);

}  // namespace onramp
