#pragma once

#include <cstddef>
#include <cstdint>
#include <span>

/// Makes one UDP exchange with the fewest possible system calls: socket, sendto, poll, recvfrom and
/// close. Waits for the reply for at most two seconds. Returns the size of the reply, or 0 when
/// there is none or a call fails. `agent` is in host byte order.
std::size_t bareExchange(std::uint32_t agent, std::uint16_t port,
                         std::span<const std::uint8_t> request, std::span<std::uint8_t> reply);
