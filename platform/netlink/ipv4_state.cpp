#include "platform/netlink/ipv4_state.h"

#include <linux/rtnetlink.h>
#include <net/if.h>
#include <netinet/in.h>
#include <netlink/errno.h>
#include <netlink/msg.h>
#include <netlink/netlink.h>
#include <netlink/route/addr.h>
#include <netlink/route/link.h>
#include <netlink/route/nexthop.h>
#include <netlink/route/route.h>

#include <cstdint>
#include <cstring>
#include <map>
#include <string>
#include <utility>
#include <vector>

#include "platform/dynamic_store.h"
#include "platform/ipv4.h"

namespace onramp::netlink {

namespace {

// The maximum number of requests for one dump (the kernel's list of a whole table). If the table
// changes during a dump, the kernel marks the dump as interrupted, and it must be requested again.
constexpr int kDumpAttempts = 16;

using Objects = std::vector<Object>;
using Names = std::map<int, std::string>;

struct Collector {
  bool (*wanted)(nl_object*);
  Objects objects;

  static void take(nl_object* object, void* collector) {
    auto& self = *static_cast<Collector*>(collector);
    if (!self.wanted(object)) return;
    nl_object_get(object);
    self.objects.emplace_back(object);
  }

  static int takeMessage(nl_msg* message, void* collector) {
    const int error = nl_msg_parse(message, take, collector);
    return error < 0 ? error : NL_OK;
  }
};

// Returns the kernel's objects of one kind for which `wanted` returns true, in the kernel's order.
// Returns nothing on failure.
std::optional<Objects> dump(nl_sock* socket, int request, int family, bool (*wanted)(nl_object*)) {
  for (int attempt = 0; attempt < kDumpAttempts; ++attempt) {
    Collector collector{wanted, {}};
    nl_socket_modify_cb(socket, NL_CB_VALID, NL_CB_CUSTOM, Collector::takeMessage, &collector);
    if (nl_rtgen_request(socket, request, family, NLM_F_DUMP) < 0) return std::nullopt;
    const int error = nl_recvmsgs_default(socket);
    if (error >= 0) return std::move(collector.objects);
    if (error != -NLE_DUMP_INTR) return std::nullopt;
  }
  return std::nullopt;
}

rtnl_link* asLink(nl_object* object) {
  return reinterpret_cast<rtnl_link*>(object);
}
rtnl_addr* asAddress(nl_object* object) {
  return reinterpret_cast<rtnl_addr*>(object);
}
rtnl_route* asRoute(nl_object* object) {
  return reinterpret_cast<rtnl_route*>(object);
}

bool isUsableAddress(nl_object* object) {
  const nl_addr* local = rtnl_addr_get_local(asAddress(object));
  const int prefix = rtnl_addr_get_prefixlen(asAddress(object));
  return local && nl_addr_get_family(local) == AF_INET && prefix >= 0 && prefix <= 32;
}

bool isDefaultRoute(nl_object* object) {
  rtnl_route* route = asRoute(object);
  const nl_addr* destination = rtnl_route_get_dst(route);
  return rtnl_route_get_table(route) == RT_TABLE_MAIN &&
         rtnl_route_get_type(route) == RTN_UNICAST &&
         (!destination || nl_addr_get_prefixlen(destination) == 0);
}

std::optional<std::string> dotted(const nl_addr* address) {
  in_addr raw{};
  if (!address || nl_addr_get_len(address) != sizeof raw) return std::nullopt;
  std::memcpy(&raw, nl_addr_get_binary_addr(address), sizeof raw);
  return dottedIPv4({ntohl(raw.s_addr)});
}

std::string dottedMask(int prefix) {
  return dottedIPv4({prefix == 0 ? 0 : ~std::uint32_t{0} << (32 - prefix)});
}

struct Interface {
  Array addresses;
  Array broadcasts;
  Array masks;

  void add(rtnl_addr* address) {
    const std::optional<std::string> local = dotted(rtnl_addr_get_local(address));
    if (!local) return;
    addresses.emplace_back(*local);
    masks.emplace_back(dottedMask(rtnl_addr_get_prefixlen(address)));
    if (const auto broadcast = dotted(rtnl_addr_get_broadcast(address))) {
      broadcasts.emplace_back(*broadcast);
    }
  }

  [[nodiscard]] Dictionary state() const {
    const Dictionary state{{kSCPropNetIPv4Addresses, addresses},
                           {kSCPropNetIPv4SubnetMasks, masks}};
    return broadcasts.empty() ? state : state.with(kSCPropNetIPv4BroadcastAddresses, broadcasts);
  }
};

std::map<int, Interface> interfacesOf(const Objects& addresses) {
  std::map<int, Interface> interfaces;
  for (const Object& address : addresses) {
    interfaces[rtnl_addr_get_ifindex(asAddress(address.get()))].add(asAddress(address.get()));
  }
  return interfaces;
}

// Returns the interface index of the preferred route, or nothing when no route is usable.
std::optional<int> primaryIndex(const Objects& routes) {
  std::optional<int> index;
  std::uint32_t lowest = 0;
  for (const Object& object : routes) {
    rtnl_route* route = asRoute(object.get());
    const std::uint32_t metric = rtnl_route_get_priority(route);
    if (index && metric >= lowest) continue;
    for (int n = 0; n < rtnl_route_get_nnexthops(route); ++n) {
      rtnl_nexthop* hop = rtnl_route_nexthop_n(route, n);
      if ((rtnl_route_nh_get_flags(hop) & RTNH_F_DEAD) != 0) continue;
      index = rtnl_route_nh_get_ifindex(hop);
      lowest = metric;
      break;
    }
  }
  return index;
}

}  // namespace

Socket openRouteSocket() {
  Socket socket(nl_socket_alloc());
  if (!socket || nl_connect(socket.get(), NETLINK_ROUTE) < 0) return nullptr;
  nl_socket_enable_msg_peek(socket.get());
  return socket;
}

std::optional<Dictionary> readIPv4State(nl_sock* socket, bool withGlobal) {
  const auto any = [](nl_object*) { return true; };
  const auto links = dump(socket, RTM_GETLINK, AF_UNSPEC, any);
  const auto addresses = dump(socket, RTM_GETADDR, AF_INET, isUsableAddress);
  const auto routes = withGlobal ? dump(socket, RTM_GETROUTE, AF_INET, isDefaultRoute)
                                 : std::optional<Objects>(std::in_place);
  if (!links || !addresses || !routes) return std::nullopt;

  const std::map<int, Interface> interfaces = interfacesOf(*addresses);
  const std::optional<int> primary = primaryIndex(*routes);
  std::vector<Dictionary::Pair> state;
  for (const Object& object : *links) {
    rtnl_link* link = asLink(object.get());
    const int index = rtnl_link_get_ifindex(link);
    const std::string name = rtnl_link_get_name(link);
    const bool up = (~rtnl_link_get_flags(link) & (IFF_UP | IFF_RUNNING)) == 0;
    if (const auto found = interfaces.find(index); up && found != interfaces.end()) {
      state.emplace_back(
          *createNetworkInterfaceEntityKey(kSCDynamicStoreDomainState, name, kSCEntNetIPv4),
          found->second.state());
    }
    if (primary == index) {
      state.emplace_back(*createNetworkGlobalEntityKey(kSCDynamicStoreDomainState, kSCEntNetIPv4),
                         Dictionary{{kSCDynamicStorePropNetPrimaryInterface, name}});
    }
  }
  return Dictionary(std::move(state));
}

}  // namespace onramp::netlink
