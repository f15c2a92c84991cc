#pragma once

#include <cstdint>
#include <string_view>

#include "base/maker.h"

/// The protocol constants that this program and the devices share.
namespace onramp {

/// The SNMP community that devices answer to.
inline constexpr std::string_view kCommunity = maker::kSnmpCommunity;

/// The UDP port that devices listen on (RFC 1157 section 4).
inline constexpr std::uint16_t kSnmpPort = 161;

/// The object identifier of ActiveIF, an INTEGER that tells which network interface a device is
/// using.
inline constexpr auto kActiveIFObject = maker::kActiveIFObject;

/// The value of ActiveIF for the wireless interface. Every other value means another interface.
inline constexpr std::int64_t kActiveIFWireless = maker::kActiveIFWireless;

}  // namespace onramp
