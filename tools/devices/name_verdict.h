#pragma once

#include <optional>

#include "tools/devices/verdict.h"

namespace onramp::devices {

/// Returns why the device's maker and model match none of the medium's models; nothing when they
/// match one.
[[nodiscard]] std::optional<Verdict> judgeName(const Device& device, const Medium& medium);

/// Returns the IPv4 addresses in a KSDevice record as text.
[[nodiscard]] std::vector<std::string> ipv4AddressesOf(const Dictionary& record);

}  // namespace onramp::devices
