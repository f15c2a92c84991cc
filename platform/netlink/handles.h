#pragma once

#include <netlink/object.h>
#include <netlink/socket.h>

#include <memory>

#include "base/released_by.h"

namespace onramp::netlink {

using Socket = std::unique_ptr<nl_sock, ReleasedBy<nl_socket_free>>;
using Object = std::unique_ptr<nl_object, ReleasedBy<nl_object_put>>;

/// Opens a socket to the kernel's routing subsystem. Returns null on failure.
[[nodiscard]] Socket openRouteSocket();

}  // namespace onramp::netlink
