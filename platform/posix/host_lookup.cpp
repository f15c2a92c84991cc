#include "platform/host_lookup.h"

#include <arpa/inet.h>
#include <netdb.h>

#include <array>

namespace onramp {

std::optional<std::string> lookUpIPv4Address(const std::string& name) {
  const hostent* const host = gethostbyname(name.c_str());
  if (!host || host->h_addrtype != AF_INET || !host->h_addr_list[0]) return std::nullopt;
  std::array<char, INET_ADDRSTRLEN> text{};
  if (!inet_ntop(AF_INET, host->h_addr_list[0], text.data(), text.size())) return std::nullopt;
  return text.data();
}

}  // namespace onramp
