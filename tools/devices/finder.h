#pragma once

#include <chrono>
#include <functional>
#include <map>
#include <memory>
#include <set>
#include <string>
#include <utility>
#include <vector>

#include "bonjour/KSBonjour.h"
#include "platform/discovery_state.h"
#include "tools/devices/device.h"

namespace onramp::devices {

/// Browses several service types at once and combines their announcements into devices. Main thread
/// only.
class Finder final : public KSBonjourObserver, public std::enable_shared_from_this<Finder> {
 public:
  /// Called with a device when it is found under a type, is resolved, or has left a type.
  using Changed = std::function<void(Device& device)>;

  /// For a device that is announced under several types, the announcement under `preferred` is
  /// resolved, or else the first one that was found.
  Finder(std::string preferred, Changed changed);
  Finder(const Finder&) = delete;
  Finder& operator=(const Finder&) = delete;
  ~Finder() override = default;

  /// Starts browsing `types`, and with `all` every other type that is announced. Until stop(), the
  /// finder and its browsers keep each other alive.
  void start(const std::vector<std::string>& types, bool all);
  void stop();

  /// Returns all devices seen so far, in the order of their names. The finder owns them.
  [[nodiscard]] std::vector<Device*> devices();

  /// Returns the seconds since start().
  [[nodiscard]] double now() const;

  void addBonjourService(const NetServiceRef& service) override;
  void removeBonjourService(const NetServiceRef& service) override;
  void resolvedBonjourService(const NetServiceRef& service) override;

 private:
  static void typeFound(const NetServiceBrowserRef& browser, unsigned long flags,
                        const NetServiceRef& service, const NetServiceError& error, void* self);
  void browse(const std::string& type);
  Device* deviceOf(const NetServiceRef& service);
  void sighted(const ServiceSighting& sighting);

  std::string preferred_;
  Changed changed_;
  std::chrono::steady_clock::time_point start_;
  std::vector<std::shared_ptr<KSBonjour>> browsers_;
  NetServiceBrowserRef typeBrowser_;
  std::map<std::pair<std::string, std::string>, Device> devices_;
  // Kept apart, because a service is seen before the device that it belongs to is known.
  std::map<std::pair<std::string, std::string>, std::set<std::string>> sightings_;
};

}  // namespace onramp::devices
