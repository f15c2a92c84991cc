#pragma once

#include <cstddef>
#include <cstdint>
#include <span>

/// Makes one UDP exchange with only five system calls: socket, sendto, poll, recvfrom and close.
/// Sends `request` to `port` of the IPv4 address `agent`, both in host byte order. Waits at most
/// two seconds for a reply. Stores the reply in `reply` and returns its size in bytes. Returns 0
/// when no reply comes or a call fails.
std::size_t bareExchange(std::uint32_t agent, std::uint16_t port,
                         std::span<const std::uint8_t> request, std::span<std::uint8_t> reply);
