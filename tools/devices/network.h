#pragma once

#include <vector>

#include "tools/devices/verdict.h"

namespace onramp::devices {

/// Returns the reason why the search found no device: no discovery daemon, no network, multicast
/// blocked, or nothing announced. `seconds` is how long the search took. If devices were found,
/// only a missing daemon counts as a problem.
[[nodiscard]] std::vector<Verdict> networkProblems(bool hasFoundDevices, double seconds);

/// Returns whether `address`, a dotted IPv4 text, is in a subnet of this computer. Returns false
/// before AddNetworkInterfaceListChangeCallbackSCF() has been called.
[[nodiscard]] bool isInLocalSubnet(const std::string& address);

}  // namespace onramp::devices
