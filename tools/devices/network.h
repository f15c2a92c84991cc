#pragma once

#include <vector>

#include "tools/devices/verdict.h"

namespace onramp::devices {

/// Returns a list with the first problem of the network as a whole, or an empty list. A missing
/// discovery daemon is always a problem. The other problems count only if the search found
/// no device: no network, blocked multicast, and no announcement within `seconds`, the duration of
/// the search.
[[nodiscard]] std::vector<Verdict> networkProblems(bool hasFoundDevices, double seconds);

/// Returns whether local_address_for_destination() finds a subnet of this computer that contains
/// `address`, an IPv4 address in dotted form. Returns false before
/// AddNetworkInterfaceListChangeCallbackSCF() has been called.
[[nodiscard]] bool isInLocalSubnet(const std::string& address);

}  // namespace onramp::devices
