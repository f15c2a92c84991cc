#pragma once

#include <optional>

#include "base/value.h"
#include "platform/netlink/handles.h"

namespace onramp::netlink {

/// The store's whole IPv4 state, read from the kernel through `socket`: every entry that
/// platform/dynamic_store.h promises, under its key. The global entry, for which the kernel's
/// routes have to be gone through, only `withGlobal`. Nothing when the kernel cannot be asked.
///
/// The preferred default route is the main table's with the lowest metric, the first one of equals,
/// and leads through its first next hop that is not dead.
[[nodiscard]] std::optional<Dictionary> readIPv4State(nl_sock* socket, bool withGlobal);

}  // namespace onramp::netlink
