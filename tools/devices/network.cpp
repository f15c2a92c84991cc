#include "tools/devices/network.h"

#include <array>
#include <cstdint>
#include <string>

#include "netconfig/local_address_cache.h"
#include "netconfig/local_address_list.h"
#include "platform/datagram_socket.h"
#include "platform/discovery_state.h"
#include "tools/devices/text.h"

namespace onramp::devices {

namespace {

// The group and port of multicast DNS (RFC 6762 section 3).
constexpr IPv4Address kMulticastDNSGroup{0xE00000FB};
constexpr std::uint16_t kMulticastDNSPort = 5353;

// A query for all service types (RFC 6763 section 9). The header is followed by one question: name
// "_services._dns-sd._udp.local", type PTR, class IN.
constexpr std::array<std::uint8_t, 46> kQuestion{
    0,   0,   0,   0,   0,   1,   0,   0,   0,   0,   0,   0,   9,   '_', 's', 'e',
    'r', 'v', 'i', 'c', 'e', 's', 7,   '_', 'd', 'n', 's', '-', 's', 'd', 4,   '_',
    'u', 'd', 'p', 5,   'l', 'o', 'c', 'a', 'l', 0,   0,   12,  0,   1};

bool hasNetwork() {
  local_address_list list;
  if (KSSysConfigCopyCurrentLocalAddressList(&list) != 0) return true;
  for (std::size_t i = 0; i < local_address_list_count(list); ++i) {
    const std::string* const address = local_address_at(list, i);
    if (address && !address->starts_with("127.")) return true;
  }
  return false;
}

bool canSendMulticast() {
  auto socket = DatagramSocket::open();
  return socket && socket->sendTo({kMulticastDNSGroup, kMulticastDNSPort}, kQuestion);
}

}  // namespace

bool isInLocalSubnet(const std::string& address) {
  return local_address_for_destination(address).has_value();
}

std::vector<Verdict> networkProblems(bool hasFoundDevices, double seconds) {
  if (const auto problem = discoveryProblem()) {
    return {{.id = "no-daemon",
             .why = "no discovery daemon: " + *problem,
             .remedy = "start the daemon: systemctl start avahi-daemon"}};
  }
  if (hasFoundDevices) return {};
  if (!canSendMulticast()) {
    if (!hasNetwork()) {
      return {{.id = "no-network",
               .why = "no network: this computer has no address except on loopback",
               .remedy = "connect the computer to the devices' network"}};
    }
    return {{.id = "multicast-blocked",
             .why = "multicast is blocked: the system does not send to 224.0.0.251, UDP port 5353",
             .remedy = "let multicast through the firewall, or add a route for 224.0.0.0/4"}};
  }
  return {{.id = "nothing-announced",
           .why = "nothing was announced within " + durationText(seconds),
           .remedy = "check that a device is on and in this subnet, that the access point does not "
                     "keep its clients apart, and that firewalls let UDP port 5353 through"}};
}

}  // namespace onramp::devices
