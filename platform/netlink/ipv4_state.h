#pragma once

#include <optional>

#include "base/value.h"
#include "platform/netlink/handles.h"

namespace onramp::netlink {

/// Reads the IPv4 state from the kernel through `socket`. Returns the entries that
/// platform/dynamic_store.h promises, each under its key. Leaves out the global entry, for which
/// all routes must be read, unless `withGlobal` is true. Returns nothing when the state cannot be
/// read.
///
/// A default route of the main table is usable if it has a next hop that is not dead. Of the usable
/// default routes, the first one with the lowest metric is preferred. The primary interface is the
/// interface of that route's first next hop that is not dead.
[[nodiscard]] std::optional<Dictionary> readIPv4State(nl_sock* socket, bool withGlobal);

}  // namespace onramp::netlink
