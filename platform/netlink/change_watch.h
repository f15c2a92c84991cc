#pragma once

#include <functional>
#include <memory>
#include <thread>

#include "platform/netlink/handles.h"
#include "platform/posix/descriptor.h"

namespace onramp::netlink {

/// Reports that the computer's interfaces, IPv4 addresses or, on request, IPv4 routes may have
/// changed. It does not say what has changed, so the caller must ask the kernel for the new state.
class ChangeWatch {
 public:
  /// Creates a watch that notices changes from this call on, but route changes only if `withRoutes`
  /// is true. Returns null on failure.
  [[nodiscard]] static std::unique_ptr<ChangeWatch> create(bool withRoutes);

  ChangeWatch(const ChangeWatch&) = delete;
  ChangeWatch& operator=(const ChangeWatch&) = delete;
  ~ChangeWatch();

  /// Starts a thread that calls `changed` after every burst of changes. Changes since create() also
  /// count. The destructor stops the calls and waits for a running call to return. If the socket to
  /// the kernel fails, the calls stop for good without a report. Returns false when the thread
  /// cannot be created. Must not be called twice.
  [[nodiscard]] bool start(std::function<void()> changed);

 private:
  explicit ChangeWatch(Socket socket);
  void run(const std::function<void()>& changed) const;

  Socket socket_;
  posix::Descriptor stop_;
  std::thread thread_;
};

}  // namespace onramp::netlink
