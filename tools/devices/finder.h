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

/// Browses several service types at once and joins what they announce to devices. Main thread only.
class Finder final : public KSBonjourObserver, public std::enable_shared_from_this<Finder> {
 public:
  /// Told of every device of which something new is known.
  using Changed = std::function<void(Device& device)>;

  /// `preferred` is the type whose announcement counts for a device that has several.
  Finder(std::string preferred, Changed changed);
  Finder(const Finder&) = delete;
  Finder& operator=(const Finder&) = delete;
  ~Finder() override = default;

  /// Starts to browse `types`. Until stop(), the finder and its browsers hold each other.
  void start(const std::vector<std::string>& types);
  void stop();

  /// All devices seen so far, by their names.
  [[nodiscard]] std::vector<Device*> devices();

  /// Seconds since start().
  [[nodiscard]] double now() const;

  void addBonjourService(const NetServiceRef& service) override;
  void removeBonjourService(const NetServiceRef& service) override;
  void resolvedBonjourService(const NetServiceRef& service) override;

 private:
  Device* deviceOf(const NetServiceRef& service);
  void sighted(const ServiceSighting& sighting);

  std::string preferred_;
  Changed changed_;
  std::chrono::steady_clock::time_point start_;
  std::vector<std::shared_ptr<KSBonjour>> browsers_;
  std::map<std::pair<std::string, std::string>, Device> devices_;
  // Sightings come before the services that they are folded to.
  std::map<std::pair<std::string, std::string>, std::set<std::string>> sightings_;
};

}  // namespace onramp::devices
