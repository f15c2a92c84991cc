#pragma once

#include <optional>
#include <string>
#include <string_view>

#include "base/value.h"

namespace onramp {

/// What the medium says about one model: its connections and its support-centre identifier. Each
/// request reads the medium anew; who asks about many models at once loads the model information
/// once with modelInfo() and hands it in.
class KSOROSXModel {
 public:
  KSOROSXModel() = delete;

  // Keys of the record.
  static constexpr std::string_view kName = "name";                         ///< string
  static constexpr std::string_view kKSCModelID = "KSC model ID";           ///< any value
  static constexpr std::string_view kSupportUSB = "support USB";            ///< boolean
  static constexpr std::string_view kSupportEthernet = "support Ethernet";  ///< boolean
  static constexpr std::string_view kSupportWiFi = "support WiFi";          ///< boolean

  /// The model information of the medium that the application lies on; nothing when unreadable.
  [[nodiscard]] static std::optional<Dictionary> modelInfo();

  /// The record of the model `name`.
  [[nodiscard]] static Dictionary initWithName(const std::optional<std::string>& name);

  /// The record of the model `name` by the model information `info`. A model that `info` does not
  /// list connects by USB only. The record ends at its first missing value: a listed model without
  /// an identifier has a name and nothing else, so it offers no connection at all, and no name
  /// gives an empty record.
  [[nodiscard]] static Dictionary initWithName(const std::optional<std::string>& name,
                                               const std::optional<Dictionary>& modelInfoPlist);

  [[nodiscard]] static std::string convertRelativePathToFullPath(
      const std::optional<std::string>& relativePath);
};

}  // namespace onramp
