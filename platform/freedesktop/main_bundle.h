#pragma once

#include <string>

namespace onramp {

/// Makes the folder at `path` the running application's bundle. `path` must be absolute and have no
/// trailing "/". For tests, and for tools that examine another application.
void setMainBundlePath(std::string path);

/// Returns the path of the running application's bundle, without a trailing "/". Unless
/// setMainBundlePath() has set the path, the bundle is the folder that holds
/// Contents/<system>/<executable>. If the executable is not in such a folder, the bundle is the
/// executable's folder.
[[nodiscard]] std::string mainBundlePath();

}  // namespace onramp
