#pragma once

#include "base/value.h"
#include "snmp/query.h"

namespace onramp {

/// Asks all devices of every local IPv4 subnet that has a broadcast address for the objects of
/// `table`, one subnet after the other. A result dictionary, as snmp_query_table gives it, for
/// every proper reply in the order of their coming, at most 256 a subnet; a device that replies
/// twice has two. Neither the identifier of a reply nor its sender is checked. A subnet that cannot
/// be asked only gives no results.
///
/// Blocks, for every subnet: up to 2 seconds until the request is sent, then until 5 whole seconds
/// have passed and at most 2 more. A computer that has the loopback interface alone gives the empty
/// array at once.
[[nodiscard]] Array snmp_broadcast_search(mib_table& table);

}  // namespace onramp
