#pragma once

#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "base/value.h"

namespace onramp {

/// Builds the medium's record, a dictionary that describes the medium: the models that the medium
/// supports, whether it has a printer package and a scanner package, the series code that the
/// support site uses, and the service type to search the network for.
namespace KSOROSXCD {

// Keys of the record; all five are always present.
inline constexpr std::string_view kContainedModels = "contained models";  ///< array of strings
inline constexpr std::string_view kSupportPrinterPackage = "support Printer Pacakge";  ///< boolean
inline constexpr std::string_view kSupportScannerPackage = "support Scanner Package";  ///< boolean
inline constexpr std::string_view kKSCSeriesCode = "KSC Series Code";                  ///< string
inline constexpr std::string_view kBonjourServiceType =
    "bonjour service type for browsing";  ///< string

/// Returns the record of the medium from which the wizard is running. Every call reads the medium
/// again.
[[nodiscard]] Dictionary initWithCDInfo();

/// Makes the record from two dictionaries. `CDCommonInfo` is the medium resource dictionary, from
/// which only the service type is read. `info` is the dictionary in the file that the "CDInfo"
/// entry of `CDCommonInfo` names. The models are sorted by sortIgnoringCase(). A value that is
/// absent or has the wrong type gets its default: no models, true for a package, or an empty
/// string. If `info` is not given, all values get their defaults, even the service type.
[[nodiscard]] Dictionary initWithCDInfoPlist(const std::optional<Dictionary>& info,
                                             const std::optional<Dictionary>& CDCommonInfo);

/// Returns medium::fullPath(relativePath).
[[nodiscard]] std::string convertRelativePathToFullPath(
    const std::optional<std::string>& relativePath);

}  // namespace KSOROSXCD

/// Returns the strings in the array under kContainedModels in `record`, in their order. Returns an
/// empty list when the record has no array under that key.
[[nodiscard]] std::vector<std::string> containedModels(const Dictionary& record);

}  // namespace onramp
