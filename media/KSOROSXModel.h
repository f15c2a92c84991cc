#pragma once

#include <optional>
#include <string>
#include <string_view>

#include "base/value.h"

namespace onramp {

/// What the medium says about one model: its connections and its support-centre identifier. To
/// query many models, load modelInfo() once and pass it in; otherwise every call reads the medium
/// again.
namespace KSOROSXModel {

// Keys of the record.
inline constexpr std::string_view kName = "name";                         ///< string
inline constexpr std::string_view kKSCModelID = "KSC model ID";           ///< any value
inline constexpr std::string_view kSupportUSB = "support USB";            ///< boolean
inline constexpr std::string_view kSupportEthernet = "support Ethernet";  ///< boolean
inline constexpr std::string_view kSupportWiFi = "support WiFi";          ///< boolean

/// The model information of the medium that the application lies on; nothing when it
/// cannot be read.
[[nodiscard]] std::optional<Dictionary> modelInfo();

/// The record of the model `name`.
[[nodiscard]] Dictionary initWithName(const std::optional<std::string>& name);

/// The record of the model `name` according to `modelInfoPlist`. A model that is not listed there
/// connects by USB only. The record ends at the first value that is missing: the record of a listed
/// model without an identifier has only a name and so offers no connection, and without a name the
/// record is empty.
[[nodiscard]] Dictionary initWithName(const std::optional<std::string>& name,
                                      const std::optional<Dictionary>& modelInfoPlist);

[[nodiscard]] std::string convertRelativePathToFullPath(
    const std::optional<std::string>& relativePath);

}  // namespace KSOROSXModel

}  // namespace onramp
