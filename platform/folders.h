#pragma once

#include <string>

namespace onramp {

enum class FolderDomain {
  kUser,   ///< the current user's own
  kLocal,  ///< shared by all users of this computer
};

/// Absolute path of the domain's application-support folder, without a closing "/". The folder is
/// created when it is absent; that this failed shows only when something is written there.
[[nodiscard]] std::string applicationSupportFolder(FolderDomain domain);

}  // namespace onramp
