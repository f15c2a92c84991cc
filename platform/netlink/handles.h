#pragma once

#include <netlink/object.h>
#include <netlink/socket.h>

#include <memory>

namespace onramp::netlink {

template <auto release>
struct Release {
  template <typename Handle>
  void operator()(Handle* handle) const {
    release(handle);
  }
};

using Socket = std::unique_ptr<nl_sock, Release<nl_socket_free>>;
using Object = std::unique_ptr<nl_object, Release<nl_object_put>>;

/// A new socket that speaks to the kernel's routing subsystem; null on failure.
[[nodiscard]] Socket openRouteSocket();

}  // namespace onramp::netlink
