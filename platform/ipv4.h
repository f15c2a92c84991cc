#pragma once

#include <cstdint>
#include <optional>
#include <string>

namespace onramp {

/// An IPv4 address. Its first part is the highest byte.
struct IPv4Address {
  std::uint32_t bits = 0;
  friend bool operator==(IPv4Address, IPv4Address) = default;
};

/// Reads `text` as inet_aton does: one to four parts, each of them decimal, octal after a leading 0
/// or hexadecimal after 0x. The last part fills the bytes that are left. Returns nothing for any
/// other text.
[[nodiscard]] std::optional<IPv4Address> parseIPv4(const std::string& text);

/// Returns the address in dotted form.
[[nodiscard]] std::string dottedIPv4(IPv4Address address);

}  // namespace onramp
