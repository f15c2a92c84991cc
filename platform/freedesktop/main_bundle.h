#pragma once

#include <string>

namespace onramp {

/// Makes the folder at `path` the running application's bundle. `path` must be absolute and have no
/// trailing "/". Only tests, and tools that examine another application, call this function.
void setMainBundlePath(std::string path);

/// Returns the path of the running application's bundle, without a trailing "/". If
/// setMainBundlePath() has not set the path, the bundle is the folder that holds
/// Contents/<system>/<executable>. If the executable has no path of this form, the bundle is the
/// executable's folder.
[[nodiscard]] std::string mainBundlePath();

}  // namespace onramp
