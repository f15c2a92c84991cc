#pragma once

#include <cstdint>
#include <span>
#include <string>

namespace onramp::devices {

/// Returns an SNMP message as text, with each element on one line, indented by the element's depth.
/// Bytes that form no element are shown in hexadecimal.
[[nodiscard]] std::string berTree(std::span<const std::uint8_t> bytes);

/// Returns the bytes in hexadecimal, sixteen on each line. A line starts with the offset of its
/// first byte and ends with its bytes as characters, with "." for bytes other than printable ASCII.
[[nodiscard]] std::string hexDump(std::span<const std::uint8_t> bytes);

/// Returns the bytes as hexadecimal digits without spaces.
[[nodiscard]] std::string hexText(std::span<const std::uint8_t> bytes);

}  // namespace onramp::devices
