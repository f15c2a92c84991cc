#pragma once

#include <cstdint>
#include <span>
#include <string>

namespace onramp::devices {

/// Returns the elements of an SNMP message as text, one element a line, indented by its depth.
/// Bytes that form no element are shown in hexadecimal, so the text describes all bytes of any
/// input.
[[nodiscard]] std::string berTree(std::span<const std::uint8_t> bytes);

/// Returns the bytes in hexadecimal, sixteen a line. Each line starts with the offset and ends with
/// the characters.
[[nodiscard]] std::string hexDump(std::span<const std::uint8_t> bytes);

/// Returns the bytes as hexadecimal digits without spaces.
[[nodiscard]] std::string hexText(std::span<const std::uint8_t> bytes);

}  // namespace onramp::devices
