#pragma once

#include <array>
#include <cstdint>
#include <string_view>

/// What this program and the devices have agreed on.
namespace onramp {

/// The community that devices answer to.
inline constexpr std::string_view kCommunity = "corridor";

/// The UDP port that devices listen on (RFC 1157 section 4).
inline constexpr std::uint16_t kSnmpPort = 161;

/// The object ActiveIF, an INTEGER: the interface that a device uses at the moment.
inline constexpr std::array<std::uint16_t, 14> kActiveIFObject = {1, 3, 6, 1,    4, 1, 4242,
                                                                  2, 4, 4, 1240, 1, 2, 0};

/// The value of ActiveIF that means the wireless interface. Every other value means another one.
inline constexpr std::int64_t kActiveIFWireless = 2;

}  // namespace onramp
