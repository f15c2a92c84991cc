#pragma once

#include <chrono>
#include <cstdint>
#include <functional>
#include <memory>
#include <optional>
#include <string>
#include <vector>

#include "base/value.h"
#include "platform/avahi/browse_job.h"
#include "platform/avahi/handles.h"
#include "platform/avahi/job.h"
#include "platform/avahi/loop.h"

namespace onramp::avahi {

class HostAddresses;

/// What a resolve has found, in the form in which the seam gives it.
struct Resolution {
  std::vector<Data> addressing;
  Data txt;
};

/// Resolves one service. It goes on until it has succeeded or its time is up.
class ResolveJob final : public Job {
 public:
  /// Called once, on the loop's thread; with nothing when the time was up.
  using Report = std::function<void(std::optional<Resolution>)>;

  /// A sighting without interface and protocol is looked for on all.
  ResolveJob(Sighting service, std::optional<std::chrono::milliseconds> timeLimit, Report report);

  void begin(Connection& connection) override;
  bool start(Connection& connection) override;
  [[nodiscard]] bool running() const override { return !resolvers_.empty(); }
  void stop() override;
  void lost() override {}
  // The last one to hold the job may be the main thread, and the timer is the loop's.
  void finish() override { timeUp_.reset(); }

 private:
  static void called(AvahiServiceResolver* resolver, AvahiIfIndex interface, AvahiProtocol protocol,
                     AvahiResolverEvent event, const char* name, const char* type,
                     const char* domain, const char* host, const AvahiAddress* address,
                     std::uint16_t port, AvahiStringList* txt, AvahiLookupResultFlags flags,
                     void* self);
  void found(AvahiIfIndex interface, const char* host, std::uint16_t port, AvahiStringList* txt);
  void failed();
  void end(std::optional<Resolution> resolution);

  Sighting service_;
  std::optional<std::chrono::milliseconds> timeLimit_;
  Report report_;
  Connection* connection_ = nullptr;
  std::optional<Timer> timeUp_;
  std::vector<ServiceResolverHandle> resolvers_;
  std::shared_ptr<HostAddresses> host_;
  std::uint16_t port_ = 0;
  Data txt_;
};

}  // namespace onramp::avahi
