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

/// `path` without a closing "/"; the root stays "/".
[[nodiscard]] std::string withoutClosingSlash(std::string path);

/// The full path of `relativePath`, which is relative to the folder that holds the bundle at
/// `bundlePath`. Without a relative path the result is that folder; when the bundle's path has one
/// component, it is the relative path. A closing "/" is dropped. The disk is not accessed.
[[nodiscard]] std::string fullPath(std::string_view bundlePath,
                                   const std::optional<std::string>& relativePath);

/// The same for the running application's bundle.
[[nodiscard]] std::string fullPath(const std::optional<std::string>& relativePath);

/// Reads the medium resource dictionary; nothing when it cannot be read.
[[nodiscard]] std::optional<Dictionary> loadResourceDictionary();

/// Reads the property-list dictionary whose relative path `resources` holds under `key`; nothing
/// when the path is absent or the file cannot be read.
[[nodiscard]] std::optional<Dictionary> loadNamedDictionary(
    const std::optional<Dictionary>& resources, std::string_view key);

/// The vendor name that `resources` holds, without its blanks; empty when there is none.
[[nodiscard]] std::string vendorName(const std::optional<Dictionary>& resources);

}  // namespace onramp::medium
