#pragma once

#include <functional>
#include <string>

#include "platform/avahi/handles.h"
#include "platform/avahi/job.h"

namespace onramp::avahi {

/// One sighting of a service: a service seen on several interfaces and protocols has as many. Names
/// are as Avahi has them, without closing dots.
struct Sighting {
  AvahiIfIndex interface = AVAHI_IF_UNSPEC;
  AvahiProtocol protocol = AVAHI_PROTO_UNSPEC;
  std::string name;
  std::string type;
  std::string domain;
  friend auto operator<=>(const Sighting&, const Sighting&) = default;
};

enum class BrowseEvent {
  kFound,
  kGone,
  kAllGone,  ///< the daemon went: no sighting holds any more
};

/// Browses for one service type.
class BrowseJob final : public Job {
 public:
  using Report = std::function<void(BrowseEvent, const Sighting&)>;

  /// An empty domain stands for the default one. `report` is called on the loop's thread.
  BrowseJob(std::string type, std::string domain, Report report);

  void begin(Connection& connection) override;
  bool start(Connection& connection) override;
  [[nodiscard]] bool running() const override { return browser_ != nullptr; }
  void stop() override { browser_.reset(); }
  void lost() override;

 private:
  static void called(AvahiServiceBrowser* browser, AvahiIfIndex interface, AvahiProtocol protocol,
                     AvahiBrowserEvent event, const char* name, const char* type,
                     const char* domain, AvahiLookupResultFlags flags, void* self);

  std::string type_;
  std::string domain_;
  Report report_;
  Connection* connection_ = nullptr;
  ServiceBrowserHandle browser_;
};

}  // namespace onramp::avahi
