#pragma once

#include <memory>
#include <optional>
#include <string>
#include <vector>

#include "base/value.h"
#include "bonjour/KSBonjour.h"

namespace onramp {

/// Receives the devices that a search finds, each as a record made by KSDevice. Below, a service is
/// known if the table of one of the search's browsers (KSBonjour) contains it.
class KSDeviceObserver {
 public:
  KSDeviceObserver() = default;
  KSDeviceObserver(const KSDeviceObserver&) = delete;
  KSDeviceObserver& operator=(const KSDeviceObserver&) = delete;
  virtual ~KSDeviceObserver() = default;

  /// Called when a device's service is resolved but is not known.
  virtual void addKSDevice(const Dictionary& device) = 0;
  /// Called when a device's known service is resolved, or when a device's service is reported gone
  /// but is still known. Even a new device is usually reported here, because a browser stores a
  /// resolved service before it reports the service. So an observer must add any device that is new
  /// to it.
  virtual void updateKSDevice(const Dictionary& device) = 0;
  /// Called when a device's service is reported gone and is no longer known.
  virtual void removeKSDevice(const Dictionary& device) = 0;
};

/// Searches the network for devices that offer the service type that the medium names. Tells the
/// observers when a device's service is resolved and when it is reported gone. Ignores services
/// that lack a name, type or domain. A running search and its browser keep each other alive, so the
/// owner of a search must call stopBrowsing() before releasing it. All functions must be called on
/// the main thread.
class KSBonjourSearch final : public KSBonjourObserver,
                              public std::enable_shared_from_this<KSBonjourSearch> {
 public:
  [[nodiscard]] static std::shared_ptr<KSBonjourSearch> init();

  KSBonjourSearch(const KSBonjourSearch&) = delete;
  KSBonjourSearch& operator=(const KSBonjourSearch&) = delete;
  ~KSBonjourSearch() override;

  /// The search keeps its observers alive and calls them in the order in which they were added.
  /// When called, an observer may remove itself or destroy the search.
  void addKSDeviceObserver(std::shared_ptr<KSDeviceObserver> observer);
  void removeKSDeviceObserver(const KSDeviceObserver* observer);

  // Each of these functions calls the corresponding function of every observer.
  void notifyAddToKSDeviceObserver(const Dictionary& device) const;
  void notifyUpdateToKSDeviceObserver(const Dictionary& device) const;
  void notifyRemoveToKSDeviceObserver(const Dictionary& device) const;

  /// Ends the running search, if there is one, and starts a new one. The new search finds nothing
  /// if the medium names no service type.
  void startBrowsing();

  /// Ends the search without calling observers. Does nothing when no search is running.
  void stopBrowsing();

  /// Returns the types, as strings, of all browsers whose tables contain a service of the browser's
  /// type with this name and domain. Returns an empty array if either argument has no value.
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
