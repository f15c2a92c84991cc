#pragma once

#include <string>

namespace onramp {

/// Makes the folder at `path` the running application's bundle. `path` must be absolute and have no
/// trailing "/". Used by tests and by tools that examine another application.
void setMainBundlePath(std::string path);

/// Returns the path of the running application's bundle, without a trailing "/". Unless
/// setMainBundlePath() has set another path, the bundle is the folder that holds
/// Contents/<system>/<executable>. For an executable in any other place, the bundle is the
/// executable's own folder.
[[nodiscard]] std::string mainBundlePath();

}  // namespace onramp
