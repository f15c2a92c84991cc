#pragma once

#include <optional>

#include "tools/devices/verdict.h"

namespace onramp::devices {

/// Returns why the device's maker and model are none of the medium's models; nothing when they are
/// one.
[[nodiscard]] std::optional<Verdict> judgeName(const Device& device, const Medium& medium);

/// The texts of a device's first IPv4 addresses.
[[nodiscard]] std::vector<std::string> ipv4AddressesOf(const Dictionary& record);

}  // namespace onramp::devices
