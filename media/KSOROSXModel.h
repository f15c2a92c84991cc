#pragma once

#include <optional>
#include <string>
#include <string_view>

#include "base/value.h"

namespace onramp {

/// Builds a model's record, a dictionary that describes the model: its name, its connections and
/// its identifier at the support centre. To query many models, call modelInfo() once and pass its
/// result to initWithName(). Otherwise initWithName() reads the medium on every call.
namespace KSOROSXModel {

// Keys of the record.
inline constexpr std::string_view kName = "name";                         ///< string
inline constexpr std::string_view kKSCModelID = "KSC model ID";           ///< any value
inline constexpr std::string_view kSupportUSB = "support USB";            ///< boolean
inline constexpr std::string_view kSupportEthernet = "support Ethernet";  ///< boolean
inline constexpr std::string_view kSupportWiFi = "support WiFi";          ///< boolean

/// Returns the model information of the medium from which the wizard is running: the dictionary in
/// the file whose path is under "ModelInfo" in the medium resource dictionary (media/medium.h).
/// Returns nothing when the medium names no such file or the file cannot be read as a dictionary.
[[nodiscard]] std::optional<Dictionary> modelInfo();

/// Returns the record of the model `name` according to the medium's model information.
[[nodiscard]] Dictionary initWithName(const std::optional<std::string>& name);

/// Returns the record of the model `name` according to `modelInfoPlist`. A model that is not listed
/// there supports USB only and has an empty identifier. A listed model supports USB only, unless
/// its entry says otherwise. If the entry of a listed model has no identifier ("KSCID"), the record
/// holds only the name. When `name` has no value, the record is empty.
[[nodiscard]] Dictionary initWithName(const std::optional<std::string>& name,
                                      const std::optional<Dictionary>& modelInfoPlist);

/// Returns medium::fullPath(relativePath).
[[nodiscard]] std::string convertRelativePathToFullPath(
    const std::optional<std::string>& relativePath);

}  // namespace KSOROSXModel

}  // namespace onramp
