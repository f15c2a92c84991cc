#pragma once

#include "base/value.h"
#include "snmp/query.h"

namespace onramp {

/// Broadcasts a request for the objects of `table` on every local IPv4 subnet that has a broadcast
/// address, one subnet after the other. Returns the results of all valid replies in order of
/// arrival, at most 256 per subnet. Each result is a dictionary like that of snmp_query_table. A
/// device that replies twice has two results, because neither the request identifier nor the sender
/// of a reply is checked. A subnet on which nothing can be sent has no results. No part of the
/// program calls this function.
///
/// Blocks for up to 2 seconds per subnet to send, then for 5 to 8 seconds to receive, or until 256
/// datagrams have arrived. Returns the empty array at once on a computer whose only interface is
/// the loopback.
[[nodiscard]] Array snmp_broadcast_search(mib_table& table);

}  // namespace onramp
