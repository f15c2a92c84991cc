#pragma once

#include <optional>
#include <string_view>

#include "base/value.h"
#include "platform/net_service.h"

namespace onramp {

/// Makes device records. A record is a dictionary that holds what one network service says about
/// its device. Unknown texts and lists are empty, except that the model name of a null service is
/// one space.
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

  /// Makes the record of `service`, whose instance was found under the service types `types`.
  /// `service` may be null, and `types` may be nothing.
  [[nodiscard]] static Dictionary initWithService(const NetServiceRef& service,
                                                  const std::optional<Array>& types);
};

}  // namespace onramp
