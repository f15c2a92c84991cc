#pragma once

#include <optional>

#include "tools/devices/verdict.h"

namespace onramp::devices {

/// Returns the reason why the device's maker and model match none of the medium's models, or
/// nothing when they match one. The device must be resolved.
[[nodiscard]] std::optional<Verdict> judgeName(const Device& device, const Medium& medium);

/// Returns the IPv4 addresses in the KSDevice record `record`, in dotted form.
[[nodiscard]] std::vector<std::string> ipv4AddressesOf(const Dictionary& record);

}  // namespace onramp::devices
