#include "platform/ipv4.h"

#include <arpa/inet.h>
#include <netinet/in.h>

#include <array>

namespace onramp {

std::optional<IPv4Address> parseIPv4(const std::string& text) {
  in_addr address{};
  if (::inet_aton(text.c_str(), &address) == 0) return std::nullopt;
  return IPv4Address{ntohl(address.s_addr)};
}

std::string dottedIPv4(IPv4Address address) {
  const in_addr raw{htonl(address.bits)};
  std::array<char, INET_ADDRSTRLEN> text{};
  ::inet_ntop(AF_INET, &raw, text.data(), text.size());
  return text.data();
}

}  // namespace onramp
