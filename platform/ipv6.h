#pragma once

#include <cstddef>
#include <span>
#include <string>

namespace onramp {

/// Returns the text form of an IPv6 address (RFC 5952). `address` holds the sixteen bytes in
/// network order.
[[nodiscard]] std::string ipv6Text(std::span<const std::byte, 16> address);

}  // namespace onramp
