#pragma once

#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "base/value.h"

namespace onramp {

/// The medium description: which models the medium serves, which packages it holds, and which
/// service type its devices are found by. Each request reads the medium anew and returns an equal
/// record.
class KSOROSXCD {
 public:
  KSOROSXCD() = delete;

  // Keys of the record; all five are always present.
  static constexpr std::string_view kContainedModels = "contained models";  ///< array of strings
  static constexpr std::string_view kSupportPrinterPackage =
      "support Printer Pacakge";  ///< boolean
  static constexpr std::string_view kSupportScannerPackage =
      "support Scanner Package";                                         ///< boolean
  static constexpr std::string_view kKSCSeriesCode = "KSC Series Code";  ///< string
  static constexpr std::string_view kBonjourServiceType =
      "bonjour service type for browsing";  ///< string

  /// The record of the medium that the application lies on.
  [[nodiscard]] static Dictionary initWithCDInfo();

  /// The record made of a medium description and a medium resource dictionary. Whatever is absent
  /// or of the wrong type takes its default; without a description the resource dictionary is not
  /// read.
  [[nodiscard]] static Dictionary initWithCDInfoPlist(
      const std::optional<Dictionary>& info, const std::optional<Dictionary>& CDCommonInfo);

  [[nodiscard]] static std::string convertRelativePathToFullPath(
      const std::optional<std::string>& relativePath);
};

/// The record's "contained models" as texts, in the record's order.
[[nodiscard]] std::vector<std::string> containedModels(const Dictionary& record);

}  // namespace onramp
