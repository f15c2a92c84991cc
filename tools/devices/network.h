#pragma once

#include <vector>

#include "tools/devices/verdict.h"

namespace onramp::devices {

/// Returns why no device at all was found: no discovery daemon, no network, multicast blocked, or
/// nothing announced. Of a network on which devices were found, only a daemon that has gone.
[[nodiscard]] std::vector<Verdict> networkProblems(bool hasFoundDevices, double seconds);

/// Whether an IPv4 address is in a subnet of this computer, as the wizard's network layer sees it.
[[nodiscard]] bool isInLocalSubnet(const std::string& address);

}  // namespace onramp::devices
