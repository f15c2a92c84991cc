#pragma once

#include <optional>
#include <string>
#include <string_view>

#include "base/value.h"

namespace onramp::medium {

// Keys of the medium resource dictionary.
inline constexpr std::string_view kCDInfo = "CDInfo";
inline constexpr std::string_view kModelInfo = "ModelInfo";
inline constexpr std::string_view kBonjourNetwork = "BonjourNetwork";
inline constexpr std::string_view kPkgInfo = "PkgInfo";
inline constexpr std::string_view kSystemMin = "SystemMin";
inline constexpr std::string_view kSystemMax = "SystemMax";
inline constexpr std::string_view kWLANtool = "WLANtool";
inline constexpr std::string_view kVenderName = "VenderName";

/// The path without closing "/"; the root stays "/".
[[nodiscard]] std::string withoutClosingSlash(std::string path);

/// The full path of `relativePath`, which counts from the folder that holds the bundle at
/// `bundlePath`. A null relative path gives that folder; a bundle path of one component gives the
/// relative path as it stands. A closing "/" is dropped. Nothing is asked of the disk.
[[nodiscard]] std::string fullPath(std::string_view bundlePath,
                                   const std::optional<std::string>& relativePath);

/// The same for the running application's bundle.
[[nodiscard]] std::string fullPath(const std::optional<std::string>& relativePath);

/// The medium resource dictionary, read from the medium anew; nothing when it cannot be read.
[[nodiscard]] std::optional<Dictionary> loadResourceDictionary();

/// The property-list dictionary whose relative path `resources` holds under `key`; nothing when the
/// path is absent or no such file can be read.
[[nodiscard]] std::optional<Dictionary> loadNamedDictionary(
    const std::optional<Dictionary>& resources, std::string_view key);

/// The vendor name that `resources` holds, without its blanks; empty when there is none.
[[nodiscard]] std::string vendorName(const std::optional<Dictionary>& resources);

}  // namespace onramp::medium
