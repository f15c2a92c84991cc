#pragma once

#include <cstddef>
#include <span>
#include <string>

namespace onramp {

/// Returns an IPv6 address, its sixteen bytes in network order, as text (RFC 5952).
[[nodiscard]] std::string ipv6Text(std::span<const std::byte, 16> address);

}  // namespace onramp
