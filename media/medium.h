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

/// Returns `path` without trailing slashes, but leaves the root "/" unchanged.
[[nodiscard]] std::string withoutClosingSlash(std::string path);

/// Returns the full path of `relativePath`, which is relative to the folder that holds the bundle
/// at `bundlePath`. If `relativePath` is not given, returns that folder. `bundlePath` must not end
/// in "/". If `bundlePath` contains no "/", the result is `relativePath`, or an empty string if
/// `relativePath` is not given. Removes trailing slashes from the result, as withoutClosingSlash()
/// does. Does not access the disk.
[[nodiscard]] std::string fullPath(std::string_view bundlePath,
                                   const std::optional<std::string>& relativePath);

/// Returns fullPath() for the bundle of the running program.
[[nodiscard]] std::string fullPath(const std::optional<std::string>& relativePath);

/// Reads the medium resource dictionary, a property list that describes the medium and names its
/// other files. The wizard's information dictionary gives the list's relative path under
/// "CommonResourcePath". Returns nothing when the list cannot be read.
[[nodiscard]] std::optional<Dictionary> loadResourceDictionary();

/// Reads the dictionary in another property list of the medium. The string under `key` in
/// `resources` is the relative path of that list. Returns nothing when `resources` is nothing or
/// has no string under `key`, and when the list cannot be read as a dictionary.
[[nodiscard]] std::optional<Dictionary> loadNamedDictionary(
    const std::optional<Dictionary>& resources, std::string_view key);

/// Returns the vendor name in `resources` without its spaces, or an empty string if there is none.
[[nodiscard]] std::string vendorName(const std::optional<Dictionary>& resources);

}  // namespace onramp::medium
