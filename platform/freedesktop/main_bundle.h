#pragma once

#include <string>

namespace onramp {

/// Makes the folder at `path`, an absolute path, the running application's bundle. Tests use this,
/// and so do tools that examine another application.
void setMainBundlePath(std::string path);

/// Returns the path of the running application's bundle, without a trailing "/". The bundle is the
/// folder that holds Contents/<system>/<executable>. For an executable that is located elsewhere,
/// it is the executable's own folder.
[[nodiscard]] std::string mainBundlePath();

}  // namespace onramp
