#pragma once

#include <cstdint>
#include <optional>
#include <string>

namespace onramp {

/// The IPv4 address that `text` means, with its first byte in the highest bits. Everything that
/// inet_aton takes is taken: "10.1" and hexadecimal and octal parts too. Nothing for other texts.
[[nodiscard]] std::optional<std::uint32_t> ipv4FromText(const std::string& text);

}  // namespace onramp
