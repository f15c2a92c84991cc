#pragma once

#include <string>

namespace onramp {

enum class FolderDomain {
  kUser,   ///< the current user's folder
  kLocal,  ///< the folder that all users of this computer share
};

/// Returns the absolute path of the domain's application-support folder, without a trailing "/".
/// If the folder does not exist, tries to create it, but does not report a failure to do so. With
/// Cocoa, returns an empty string when the system names no folder for the domain.
[[nodiscard]] std::string applicationSupportFolder(FolderDomain domain);

}  // namespace onramp
