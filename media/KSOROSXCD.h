#pragma once

#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "base/value.h"

namespace onramp {

/// Makes a record of the medium: the models that the medium serves, whether it has a printer
/// package and a scanner package, its series code at the support centre, and the service type by
/// which devices of these models are found.
namespace KSOROSXCD {

// Keys of the record; all five are always present.
inline constexpr std::string_view kContainedModels = "contained models";  ///< array of strings
inline constexpr std::string_view kSupportPrinterPackage = "support Printer Pacakge";  ///< boolean
inline constexpr std::string_view kSupportScannerPackage = "support Scanner Package";  ///< boolean
inline constexpr std::string_view kKSCSeriesCode = "KSC Series Code";                  ///< string
inline constexpr std::string_view kBonjourServiceType =
    "bonjour service type for browsing";  ///< string

/// Returns the record of the medium that the wizard is on. Every call reads the medium again.
[[nodiscard]] Dictionary initWithCDInfo();

/// Returns the record for the dictionary `info`, which is in the file that "CDInfo" names, and the
/// medium resource dictionary `CDCommonInfo`. A value that is absent or of the wrong type gets its
/// default: no models, true for a package, an empty text. Without `info`, all values get their
/// defaults, even the service type, which comes from `CDCommonInfo`.
[[nodiscard]] Dictionary initWithCDInfoPlist(const std::optional<Dictionary>& info,
                                             const std::optional<Dictionary>& CDCommonInfo);

/// Returns medium::fullPath(relativePath).
[[nodiscard]] std::string convertRelativePathToFullPath(
    const std::optional<std::string>& relativePath);

}  // namespace KSOROSXCD

/// Returns the strings under kContainedModels, in the record's order. Returns no models when the
/// record has no such array.
[[nodiscard]] std::vector<std::string> containedModels(const Dictionary& record);

}  // namespace onramp
