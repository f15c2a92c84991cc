#pragma once

#include <optional>

#include "base/value.h"
#include "platform/netlink/handles.h"

namespace onramp::netlink {

/// Reads the store's whole IPv4 state from the kernel through `socket`: every entry that
/// platform/dynamic_store.h promises, under its key. The global entry is included only if
/// `withGlobal` is true, because it requires reading all routes. Returns nothing when the state
/// cannot be read.
///
/// A default route of the main table is usable if it has a next hop that is not dead. The preferred
/// default route is the first usable one with the lowest metric. The interface of this route's
/// first hop that is not dead is the primary interface.
[[nodiscard]] std::optional<Dictionary> readIPv4State(nl_sock* socket, bool withGlobal);

}  // namespace onramp::netlink
