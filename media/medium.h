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

/// Returns `path` without slashes at its end; the root stays "/".
[[nodiscard]] std::string withoutClosingSlash(std::string path);

/// Returns the full path of `relativePath`, which is relative to the folder that holds the bundle
/// at `bundlePath`. Without a relative path, returns that folder. When `bundlePath` contains no
/// "/", returns the relative path itself. Drops slashes at the end. Does not access the disk.
[[nodiscard]] std::string fullPath(std::string_view bundlePath,
                                   const std::optional<std::string>& relativePath);

/// Returns the full path of `relativePath` for the running application's bundle.
[[nodiscard]] std::string fullPath(const std::optional<std::string>& relativePath);

/// Reads the medium resource dictionary, a property list that describes the medium and names its
/// other files. Returns nothing when it cannot be read.
[[nodiscard]] std::optional<Dictionary> loadResourceDictionary();

/// Reads the property-list dictionary whose relative path `resources` holds under `key`. Returns
/// nothing when the path is absent or the file cannot be read.
[[nodiscard]] std::optional<Dictionary> loadNamedDictionary(
    const std::optional<Dictionary>& resources, std::string_view key);

/// Returns the vendor name in `resources` without its spaces; empty when there is none.
[[nodiscard]] std::string vendorName(const std::optional<Dictionary>& resources);

}  // namespace onramp::medium
