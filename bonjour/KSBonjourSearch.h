#pragma once

#include <memory>
#include <optional>
#include <string>
#include <vector>

#include "base/value.h"
#include "bonjour/KSBonjour.h"

namespace onramp {

/// Receives the devices of a search, each as a KSDevice record.
class KSDeviceObserver {
 public:
  KSDeviceObserver() = default;
  KSDeviceObserver(const KSDeviceObserver&) = delete;
  KSDeviceObserver& operator=(const KSDeviceObserver&) = delete;
  virtual ~KSDeviceObserver() = default;

  /// Called when a device that is in no browser's table is resolved.
  virtual void addKSDevice(const Dictionary& device) = 0;
  /// Called when a device that is in a browser's table is resolved, and when a device is reported
  /// gone but is still in a browser's table. The search usually reports a new device by this
  /// function, so an observer must add a device that it does not know.
  virtual void updateKSDevice(const Dictionary& device) = 0;
  /// Called when a device is gone from the tables of all browsers.
  virtual void removeKSDevice(const Dictionary& device) = 0;
};

/// Searches the network for devices of the medium's service type and reports each device when it is
/// resolved. A running search and its browsers keep each other alive, so stopBrowsing() must be
/// called before the search can be destroyed. All functions must be called on the main thread.
class KSBonjourSearch final : public KSBonjourObserver,
                              public std::enable_shared_from_this<KSBonjourSearch> {
 public:
  [[nodiscard]] static std::shared_ptr<KSBonjourSearch> init();

  KSBonjourSearch(const KSBonjourSearch&) = delete;
  KSBonjourSearch& operator=(const KSBonjourSearch&) = delete;
  ~KSBonjourSearch() override;

  /// Observers are retained and called in the order in which they were added. They may remove
  /// themselves or destroy the search.
  void addKSDeviceObserver(std::shared_ptr<KSDeviceObserver> observer);
  void removeKSDeviceObserver(const KSDeviceObserver* observer);

  // Each calls the corresponding function of every observer.
  void notifyAddToKSDeviceObserver(const Dictionary& device) const;
  void notifyUpdateToKSDeviceObserver(const Dictionary& device) const;
  void notifyRemoveToKSDeviceObserver(const Dictionary& device) const;

  /// Stops the running search, if there is one, then searches for the service type that the medium
  /// names.
  void startBrowsing();

  /// Ends the search without calling observers.
  void stopBrowsing();

  /// Returns the type of each browser whose table has a service with this name and domain, in the
  /// order of the browsers. Returns no types when an argument is nothing.
  [[nodiscard]] Array supportTypes(const std::optional<std::string>& name,
                                   const std::optional<std::string>& domain) const;

  void addBonjourService(const NetServiceRef& service) override;
  void removeBonjourService(const NetServiceRef& service) override;
  void resolvedBonjourService(const NetServiceRef& service) override;

 private:
  KSBonjourSearch() = default;

  std::vector<std::shared_ptr<KSDeviceObserver>> _aryObserver;
  std::vector<std::shared_ptr<KSBonjour>> _aryKSBonjour;
};

}  // namespace onramp
