#pragma once

#include <functional>
#include <memory>
#include <thread>

#include "platform/netlink/handles.h"
#include "platform/posix/descriptor.h"

namespace onramp::netlink {

/// Tells that something about the computer's interfaces, IPv4 addresses or, on request, IPv4 routes
/// may have changed; what it is, the kernel has to be asked for.
class ChangeWatch {
 public:
  /// Hears of changes from now on. Null on failure.
  [[nodiscard]] static std::unique_ptr<ChangeWatch> create(bool withRoutes);

  ChangeWatch(const ChangeWatch&) = delete;
  ChangeWatch& operator=(const ChangeWatch&) = delete;
  ~ChangeWatch();

  /// Calls `changed` from a thread of the watch's own after every burst of changes, those since
  /// creation included, until destruction, which waits for a running call. Once only.
  void start(std::function<void()> changed);

 private:
  explicit ChangeWatch(Socket socket);
  void run(const std::function<void()>& changed) const;

  Socket socket_;
  posix::Descriptor stop_;
  std::thread thread_;
};

}  // namespace onramp::netlink
