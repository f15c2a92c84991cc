#include "bench/snmp/posix/bare_exchange.h"

#include <netinet/in.h>
#include <poll.h>
#include <sys/socket.h>
#include <unistd.h>

std::size_t bareExchange(std::uint32_t agent, std::uint16_t port,
                         std::span<const std::uint8_t> request, std::span<std::uint8_t> reply) {
  const int descriptor = ::socket(AF_INET, SOCK_DGRAM, 0);
  sockaddr_in address{};
  address.sin_family = AF_INET;
  address.sin_port = htons(port);
  address.sin_addr.s_addr = htonl(agent);
  ::sendto(descriptor, request.data(), request.size(), 0,
           reinterpret_cast<const sockaddr*>(&address), sizeof address);
  pollfd readable{descriptor, POLLIN, 0};
  ssize_t received = 0;
  if (::poll(&readable, 1, 2000) == 1) {
    socklen_t size = sizeof address;
    received = ::recvfrom(descriptor, reply.data(), reply.size(), 0,
                          reinterpret_cast<sockaddr*>(&address), &size);
  }
  ::close(descriptor);
  return received > 0 ? static_cast<std::size_t>(received) : 0;
}
