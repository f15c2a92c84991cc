#pragma once

#include <functional>
#include <memory>
#include <thread>

#include "platform/netlink/handles.h"
#include "platform/posix/descriptor.h"

namespace onramp::netlink {

/// Reports that the computer's interfaces, IPv4 addresses or, on request, IPv4 routes may have
/// changed. It does not say how; ask the kernel for the new state.
class ChangeWatch {
 public:
  /// Starts to collect changes. Returns null on failure.
  [[nodiscard]] static std::unique_ptr<ChangeWatch> create(bool withRoutes);

  ChangeWatch(const ChangeWatch&) = delete;
  ChangeWatch& operator=(const ChangeWatch&) = delete;
  ~ChangeWatch();

  /// Calls `changed` after every burst of changes since creation, on the watch's own thread. The
  /// destructor ends this and waits for a running call. May be called once.
  void start(std::function<void()> changed);

 private:
  explicit ChangeWatch(Socket socket);
  void run(const std::function<void()>& changed) const;

  Socket socket_;
  posix::Descriptor stop_;
  std::thread thread_;
};

}  // namespace onramp::netlink
