#include "platform/ipv4_address.h"

#include <arpa/inet.h>

namespace onramp {

std::optional<std::uint32_t> ipv4FromText(const std::string& text) {
  in_addr address{};
  if (inet_aton(text.c_str(), &address) == 0) return std::nullopt;
  return ntohl(address.s_addr);
}

}  // namespace onramp
