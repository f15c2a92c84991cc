#pragma once

#include <array>
#include <cstdint>
#include <optional>
#include <string>

namespace onramp {

/// The first IPv4 address of the host `name`, asked of the system's name services; nothing when it
/// has none. Dotted addresses stand for themselves. Blocks as long as those services take.
[[nodiscard]] std::optional<std::array<std::uint8_t, 4>> lookUpIPv4(const std::string& name);

}  // namespace onramp
