#pragma once

#include <cstdint>
#include <optional>
#include <string>

namespace onramp {

/// An IPv4 address, its first part in the highest byte.
struct IPv4Address {
  std::uint32_t bits = 0;
  friend bool operator==(IPv4Address, IPv4Address) = default;
};

/// The address that `text` gives as inet_aton reads it: one to four parts, each decimal, octal
/// after a leading 0 or hexadecimal after 0x, the last one filling the rest. Nothing for any other
/// text.
[[nodiscard]] std::optional<IPv4Address> parseIPv4(const std::string& text);

/// The address in dotted form.
[[nodiscard]] std::string dottedIPv4(IPv4Address address);

}  // namespace onramp
