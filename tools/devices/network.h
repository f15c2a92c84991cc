#pragma once

#include <vector>

#include "tools/devices/verdict.h"

namespace onramp::devices {

/// Returns why no device was found: no discovery daemon, no network, multicast blocked, or nothing
/// announced in the `seconds` of the search. If devices were found, returns only a missing daemon.
[[nodiscard]] std::vector<Verdict> networkProblems(bool hasFoundDevices, double seconds);

/// Returns whether an IPv4 address is in a subnet of this computer. Uses the wizard's own code.
[[nodiscard]] bool isInLocalSubnet(const std::string& address);

}  // namespace onramp::devices
