#pragma once

#include "base/value.h"
#include "snmp/query.h"

namespace onramp {

/// Asks the devices of every local IPv4 subnet that has a broadcast address for the objects of
/// `table`, one subnet after the other. Returns a result dictionary, as snmp_query_table does, for
/// every proper reply, in order of arrival and at most 256 a subnet. A device that replies twice
/// has two results, because neither a reply's identifier nor its sender is checked. A subnet that
/// cannot be asked contributes nothing. No part of the program calls it.
///
/// Blocks for each subnet: up to 2 seconds to send, then 5 whole seconds and at most 2 more. A
/// computer whose only interface is the loopback gives the empty array at once.
[[nodiscard]] Array snmp_broadcast_search(mib_table& table);

}  // namespace onramp
