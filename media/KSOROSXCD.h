#pragma once

#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "base/value.h"

namespace onramp {

/// The medium description: the models that the medium serves, the packages that it holds, and the
/// service type that its devices are found by. Every call reads the medium again and returns an
/// equal record.
namespace KSOROSXCD {

// Keys of the record; all five are always present.
inline constexpr std::string_view kContainedModels = "contained models";  ///< array of strings
inline constexpr std::string_view kSupportPrinterPackage = "support Printer Pacakge";  ///< boolean
inline constexpr std::string_view kSupportScannerPackage = "support Scanner Package";  ///< boolean
inline constexpr std::string_view kKSCSeriesCode = "KSC Series Code";                  ///< string
inline constexpr std::string_view kBonjourServiceType =
    "bonjour service type for browsing";  ///< string

/// The record of the medium that the application lies on.
[[nodiscard]] Dictionary initWithCDInfo();

/// The record for a medium description and a medium resource dictionary. Whatever is absent or of
/// the wrong type takes its default. Without a description the resource dictionary is not read.
[[nodiscard]] Dictionary initWithCDInfoPlist(const std::optional<Dictionary>& info,
                                             const std::optional<Dictionary>& CDCommonInfo);

[[nodiscard]] std::string convertRelativePathToFullPath(
    const std::optional<std::string>& relativePath);

}  // namespace KSOROSXCD

/// The record's "contained models" as texts, in the record's order.
[[nodiscard]] std::vector<std::string> containedModels(const Dictionary& record);

}  // namespace onramp
