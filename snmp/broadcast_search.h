#pragma once

#include "base/value.h"
#include "snmp/query.h"

namespace onramp {

/// Sends a request for the objects of `table` to the first broadcast address of every local IPv4
/// interface, one interface at a time. Leaves out interfaces without a broadcast address, and the
/// interface whose first address is 127.0.0.1. Returns the results of all valid replies in order of
/// arrival, at most 256 per interface. Each result is a dictionary like that of snmp_query_table. A
/// device that replies twice has two results, because neither the request identifier nor the sender
/// of a reply is checked. An interface on which nothing can be sent has no results. No part of the
/// program calls this function.
///
/// Blocks for up to 2 seconds per interface to send, then for 5 to 8 seconds to receive, or until
/// 256 attempts to receive a datagram have been made. Returns an empty array at once when no
/// interface remains, or when the interfaces cannot be read.
[[nodiscard]] Array snmp_broadcast_search(mib_table& table);

}  // namespace onramp
