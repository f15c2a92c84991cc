#pragma once

#include <optional>

#include "base/value.h"
#include "platform/netlink/handles.h"

namespace onramp::netlink {

/// Reads the IPv4 state from the kernel through `socket`. Returns every entry that
/// platform/dynamic_store.h promises, under its key. Includes the global entry only if `withGlobal`
/// is true, because all routes must be read for it. Returns nothing when the state cannot be read.
///
/// A default route of the main table is usable if it has a next hop that is not dead. Of the usable
/// default routes, the first one with the lowest metric is preferred. The primary interface is the
/// interface of that route's first next hop that is not dead.
[[nodiscard]] std::optional<Dictionary> readIPv4State(nl_sock* socket, bool withGlobal);

}  // namespace onramp::netlink
