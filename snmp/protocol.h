#pragma once

#include <array>
#include <cstdint>
#include <string_view>

/// The protocol constants that this program and the devices share.
namespace onramp {

/// The SNMP community that devices answer to.
inline constexpr std::string_view kCommunity = "corridor";

/// The UDP port that devices listen on (RFC 1157 section 4).
inline constexpr std::uint16_t kSnmpPort = 161;

/// The object identifier of ActiveIF, an INTEGER that tells which network interface a device is
/// using.
inline constexpr std::array<std::uint16_t, 14> kActiveIFObject = {1, 3, 6, 1,    4, 1, 4242,
                                                                  2, 4, 4, 1240, 1, 2, 0};

/// The value of ActiveIF for the wireless interface. Every other value means another interface.
inline constexpr std::int64_t kActiveIFWireless = 2;

}  // namespace onramp
