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

/// Browses several service types at once, and combines the services that it finds into devices. All
/// functions must be called on the main thread.
class Finder final : public KSBonjourObserver, public std::enable_shared_from_this<Finder> {
 public:
  /// Called when a service of `device` is found or disappears, and when the service that provides
  /// the device's addresses is resolved.
  using Changed = std::function<void(Device& device)>;

  /// A device may have services of several types. The finder uses the addresses and TXT record of
  /// the service of type `preferred` or, if it has never found one, of the service that it found
  /// first.
  Finder(std::string preferred, Changed changed);
  Finder(const Finder&) = delete;
  Finder& operator=(const Finder&) = delete;
  ~Finder() override = default;

  /// Starts to browse `types` and, if `all` is true, all other announced types. The finder and its
  /// browsers keep each other alive until stop() is called.
  void start(const std::vector<std::string>& types, bool all);

  /// Stops browsing. The devices found so far remain.
  void stop();

  /// Returns all devices found so far, including those that are gone, sorted by name. The finder
  /// owns them.
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
  // The sightings by name and domain. `devices_` cannot hold them all, because a service may be
  // sighted before its device is found.
  std::map<std::pair<std::string, std::string>, std::set<std::string>> sightings_;
};

}  // namespace onramp::devices
