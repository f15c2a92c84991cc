#pragma once

#include "base/value.h"
#include "snmp/query.h"

namespace onramp {

/// Broadcasts a request for the objects of `table` on each local IPv4 interface in turn, to the
/// interface's first broadcast address. Skips an interface that lacks an address or a broadcast
/// address, and one whose first address is 127.0.0.1. Returns the dictionaries that
/// snmp_table_request::result() makes from valid replies without an error status, in order of
/// arrival, at most 256 for each interface. A device that replies twice has two dictionaries,
/// because neither a reply's request identifier nor its sender is checked. A failure to send is not
/// reported; the interface then has no results. The program does not call this function.
///
/// For each interface, blocks for up to 2 seconds to send, and then for 5 to 8 seconds to receive.
/// Receiving ends sooner after 256 attempts. Returns an empty array at once when all interfaces are
/// skipped or the list of interfaces cannot be read.
[[nodiscard]] Array snmp_broadcast_search(mib_table& table);

}  // namespace onramp
