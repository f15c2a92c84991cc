#pragma once

#include <cstdint>
#include <optional>
#include <string>

namespace onramp {

/// An IPv4 address. The first part of its dotted form is the highest byte of `bits`.
struct IPv4Address {
  std::uint32_t bits = 0;
  friend bool operator==(IPv4Address, IPv4Address) = default;
};

/// Reads `text` as inet_aton does: one to four parts, each of which is decimal, octal after a
/// leading 0, or hexadecimal after 0x. The last part fills the remaining bytes. Returns nothing for
/// any other text.
[[nodiscard]] std::optional<IPv4Address> parseIPv4(const std::string& text);

/// Returns the address in dotted form.
[[nodiscard]] std::string dottedIPv4(IPv4Address address);

}  // namespace onramp
