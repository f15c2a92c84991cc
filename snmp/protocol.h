#pragma once

#include <cstdint>

#include "base/maker.h"

/// The protocol constants that this program and the devices share.
namespace onramp {

// These differ from maker to maker.
using maker::kActiveIFObject;
using maker::kActiveIFWireless;
using maker::kCommunity;

/// The UDP port that devices listen on (RFC 1157 section 4).
inline constexpr std::uint16_t kSnmpPort = 161;

}  // namespace onramp
