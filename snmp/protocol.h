#pragma once

#include <cstdint>

#include "base/maker.h"

/// The protocol constants that this program and the devices share.
namespace onramp {

// These values come from the maker's settings in maker.json.
using maker::kActiveIFObject;
using maker::kActiveIFWireless;
using maker::kCommunity;

/// The UDP port on which devices receive requests (RFC 1157 section 4).
inline constexpr std::uint16_t kSnmpPort = 161;

}  // namespace onramp
