#pragma once

#include <cstdint>
#include <optional>
#include <string>

namespace onramp {

/// An IPv4 address. The first part of its dotted form is the highest byte of `bits`. Any thread may
/// call the functions below.
struct IPv4Address {
  std::uint32_t bits = 0;
  friend bool operator==(IPv4Address, IPv4Address) = default;
};

/// Reads `text` as inet_aton does. An address has one to four parts with dots between them. Each
/// part is decimal, octal (with a leading 0) or hexadecimal (with a leading 0x). The last part
/// fills the remaining bytes, so "10.1" means 10.0.0.1. If white space follows the address, the
/// rest of `text` is ignored, so "10.0.0.1 x" is valid. Returns nothing for any other string,
/// including the empty string.
[[nodiscard]] std::optional<IPv4Address> parseIPv4(const std::string& text);

/// Returns the address in dotted form, such as "10.0.0.1".
[[nodiscard]] std::string dottedIPv4(IPv4Address address);

}  // namespace onramp
