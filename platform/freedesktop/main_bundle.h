#pragma once

#include <string>

namespace onramp {

/// Makes the folder at `path` (absolute) the running application's bundle instead of the one that
/// holds its executable. For tests.
void setMainBundlePath(std::string path);

/// Path of the running application's bundle, without a closing "/": the folder that holds
/// Contents/<system>/<executable>. For an executable anywhere else, its own folder.
[[nodiscard]] std::string mainBundlePath();

}  // namespace onramp
