#include "bonjour/ipv6_addresses.h"

#include <cstddef>
#include <span>

#include "platform/ipv6.h"

namespace onramp {

namespace {

// NetService::addressing() returns socket addresses in the BSD layout on every system. These
// constants are the offset of the address family, the offset and the size of an IPv6 address, and
// the number of the IPv6 family, which is 30 even on Linux.
constexpr std::size_t kFamilyPlace = 1;
constexpr std::size_t kIPv6Place = 8;
constexpr std::size_t kIPv6Length = 16;
constexpr std::byte kIPv6Family{30};

}  // namespace

std::vector<std::string> ipv6AddressesOf(const NetServiceRef& service) {
  std::vector<std::string> texts;
  if (!service) return texts;
  for (const Data& address : service->addressing()) {
    if (address.size() < kIPv6Place + kIPv6Length || address[kFamilyPlace] != kIPv6Family) continue;
    texts.push_back(ipv6Text(std::span(address).subspan<kIPv6Place, kIPv6Length>()));
  }
  return texts;
}

}  // namespace onramp
