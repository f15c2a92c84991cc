#pragma once

#include <array>
#include <optional>
#include <string_view>

namespace onramp {

/// The service types whose TXT keys for the device's maker and model are known.
inline constexpr std::array<std::string_view, 4> kIdentifyingTypes{
    "_pdl-datastream._tcp.", "_printer._tcp.", "_ipp._tcp.", "_scanner._tcp."};

/// The keys under which a service's TXT record holds the device's maker and model.
struct IdentityKeys {
  std::string_view manufacturer;
  std::string_view model;
};

/// Returns the keys for a service type, or nothing for a type that is not one of kIdentifyingTypes.
[[nodiscard]] constexpr std::optional<IdentityKeys> identityKeysOf(std::string_view type) {
  for (const std::string_view known : kIdentifyingTypes) {
    if (type != known) continue;
    if (type == "_scanner._tcp.") return IdentityKeys{"mfg", "mdl"};
    return IdentityKeys{"usb_MFG", "usb_MDL"};
  }
  return std::nullopt;
}

}  // namespace onramp
