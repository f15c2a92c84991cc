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
  /// Called when a device is resolved, or is reported gone while a browser still counts it. A new
  /// device is usually announced this way, so observers add a device that they do not know.
  virtual void updateKSDevice(const Dictionary& device) = 0;
  /// Called when a device is gone.
  virtual void removeKSDevice(const Dictionary& device) = 0;
};

/// Searches the network for the medium's devices and reports each one when it is resolved. While it
/// runs, it and its browsers own each other; stopBrowsing() ends that. Main thread only.
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

  // Each calls the function that it is named after on every observer.
  void notifyAddToKSDeviceObserver(const Dictionary& device) const;
  void notifyUpdateToKSDeviceObserver(const Dictionary& device) const;
  void notifyRemoveToKSDeviceObserver(const Dictionary& device) const;

  /// Stops a search that is running, then searches for the service type that the medium names.
  void startBrowsing();

  /// Ends the search without calling observers.
  void stopBrowsing();

  /// The types under which the browsers know the instance with that name and domain, in the
  /// browsers' order.
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
