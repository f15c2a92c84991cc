#pragma once

#include <string>

namespace onramp {

/// Makes the folder at `path` (absolute) the running application's bundle, in place of the one that
/// its executable lies in.
void setMainBundlePath(std::string path);

/// Path of the running application's bundle without a closing "/": the folder that holds
/// Contents/<system>/<executable>, or for an executable elsewhere the folder that it lies in.
[[nodiscard]] std::string mainBundlePath();

}  // namespace onramp
