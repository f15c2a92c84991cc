#include "platform/ipv6.h"

#include <arpa/inet.h>
#include <netinet/in.h>

#include <array>

namespace onramp {

std::string ipv6Text(std::span<const std::byte, 16> address) {
  std::array<char, INET6_ADDRSTRLEN> text{};
  ::inet_ntop(AF_INET6, address.data(), text.data(), text.size());
  return text.data();
}

}  // namespace onramp
