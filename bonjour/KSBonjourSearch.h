#pragma once

#include <memory>
#include <optional>
#include <string>
#include <vector>

#include "base/value.h"
#include "bonjour/KSBonjour.h"

namespace onramp {

/// Told of devices, each as a KSDevice record. An update of a device that the observer does not
/// know is an addition.
class KSDeviceObserver {
 public:
  KSDeviceObserver() = default;
  KSDeviceObserver(const KSDeviceObserver&) = delete;
  KSDeviceObserver& operator=(const KSDeviceObserver&) = delete;
  virtual ~KSDeviceObserver() = default;

  virtual void addKSDevice(const Dictionary& device) = 0;
  virtual void updateKSDevice(const Dictionary& device) = 0;
  virtual void removeKSDevice(const Dictionary& device) = 0;
};

/// Searches the network for the medium's devices and tells of each one once it is resolved. While
/// it runs, it and its browsers hold each other: stopBrowsing() lets go. Main thread only.
class KSBonjourSearch final : public KSBonjourObserver,
                              public std::enable_shared_from_this<KSBonjourSearch> {
 public:
  [[nodiscard]] static std::shared_ptr<KSBonjourSearch> init();

  KSBonjourSearch(const KSBonjourSearch&) = delete;
  KSBonjourSearch& operator=(const KSBonjourSearch&) = delete;
  ~KSBonjourSearch() override;

  /// Observers are retained and told in the order in which they were added.
  void addKSDeviceObserver(std::shared_ptr<KSDeviceObserver> observer);
  void removeKSDeviceObserver(const KSDeviceObserver* observer);

  void notifyAddToKSDeviceObserver(const Dictionary& device) const;
  void notifyUpdateToKSDeviceObserver(const Dictionary& device) const;
  void notifyRemoveToKSDeviceObserver(const Dictionary& device) const;

  /// Searches for the service type that the medium names, anew if it runs already.
  void startBrowsing();

  /// Ends the search; observers are not told of anything.
  void stopBrowsing();

  /// The types under which the browsers know that instance, in the browsers' order.
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
