#pragma once

#include <vector>

#include "tools/devices/verdict.h"

namespace onramp::devices {

/// Returns at most one problem of the network as a whole. A missing discovery daemon is always a
/// problem. If the search found no device, the problem is otherwise that there is no network, that
/// multicast is blocked, or that nothing was announced. `seconds` is how long the search took.
[[nodiscard]] std::vector<Verdict> networkProblems(bool hasFoundDevices, double seconds);

/// Returns whether local_address_for_destination() finds a subnet of this computer that contains
/// `address`, a dotted IPv4 text. Returns false before AddNetworkInterfaceListChangeCallbackSCF()
/// has been called.
[[nodiscard]] bool isInLocalSubnet(const std::string& address);

}  // namespace onramp::devices
