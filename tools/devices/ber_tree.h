#pragma once

#include <cstdint>
#include <span>
#include <string>

namespace onramp::devices {

/// The elements of an SNMP message, one a line, indented by their depth. Bytes that are no elements
/// are shown as such; whatever the bytes are, the result describes all of them.
[[nodiscard]] std::string berTree(std::span<const std::uint8_t> bytes);

/// The bytes in hexadecimal, sixteen a line, after their offset and before their characters.
[[nodiscard]] std::string hexDump(std::span<const std::uint8_t> bytes);

/// The bytes as hexadecimal digits without blanks.
[[nodiscard]] std::string hexText(std::span<const std::uint8_t> bytes);

}  // namespace onramp::devices
