#pragma once

#include <optional>
#include <string_view>

#include "base/value.h"
#include "platform/net_service.h"

namespace onramp {

/// Makes device records. A record is a dictionary of the facts that one of the device's network
/// services announces. If the service lacks a value, the record holds an empty string or list in
/// its place. The model name is empty if the service lacks the manufacturer or the model. The model
/// name of a null service is one space.
class KSDevice {
 public:
  KSDevice() = delete;

  // Keys of the record. All eight are always present.
  static constexpr std::string_view kDisplayName = "display name";  ///< string
  static constexpr std::string_view kModelName = "model name";      ///< string, maker and model
  static constexpr std::string_view kBonjourServiceType =
      "bonjour service type";                                            ///< array of strings
  static constexpr std::string_view kUSBManufacturer = "USB_MFG";        ///< string
  static constexpr std::string_view kUSBModel = "USB_MDL";               ///< string
  static constexpr std::string_view kLocation = "location";              ///< string
  static constexpr std::string_view kDeviceURI = "device URI";           ///< string
  static constexpr std::string_view kIPAddressList = "IP address list";  ///< array of strings

  /// Makes the record of `service`, which may be null. `types` are the service types under which
  /// the device was found. The record holds them under kBonjourServiceType, or an empty array if
  /// `types` has no value.
  [[nodiscard]] static Dictionary initWithService(const NetServiceRef& service,
                                                  const std::optional<Array>& types);
};

}  // namespace onramp
