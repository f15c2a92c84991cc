#pragma once

#include "base/value.h"
#include "snmp/query.h"

namespace onramp {

/// Sends a request for the objects of `table` to the first broadcast address of each local IPv4
/// interface, one interface after another. Skips an interface that lacks an address or a broadcast
/// address, or whose first address is 127.0.0.1. Returns the dictionaries that
/// snmp_table_request::result() makes from valid replies without an error status, in order of
/// arrival. There are at most 256 dictionaries for each interface. A device that replies twice has
/// two dictionaries, because neither the request identifier nor the sender of a reply is checked.
/// If the request cannot be sent on an interface, the interface has no results and the failure is
/// not reported. The wizard does not call this function.
///
/// For each interface, blocks for up to 2 seconds to send, and then for 5 to 8 seconds to receive.
/// Receiving ends early after 256 attempts. Returns an empty array at once when all interfaces are
/// skipped or the list of interfaces cannot be read.
[[nodiscard]] Array snmp_broadcast_search(mib_table& table);

}  // namespace onramp
