#pragma once

#include <map>
#include <memory>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "base/notification_center.h"
#include "platform/net_service.h"

namespace onramp {

// All browsers post these notifications on the default notification centre, with a null `object`,
// and observe them there. Each notification carries a NetServiceRef under kServiceInfo.
// kAddNotification also carries the browse flags, an unsigned long, under kAddFlagInfo.
// kRemoveNotification carries them under kRemoveFlagsInfo.
inline constexpr std::string_view kAddNotification = "addNotificationInternal";
inline constexpr std::string_view kRemoveNotification = "removeNotificationInternal";
inline constexpr std::string_view kResolvedNotification = "resolveNotificationInternal";
inline constexpr std::string_view kServiceInfo = "service";
inline constexpr std::string_view kAddFlagInfo = "flag";
inline constexpr std::string_view kRemoveFlagsInfo = "flags";

/// Receives the events of a browser. A running browser also forwards the events of all other
/// browsers, so a service may have a different type from the browser.
class KSBonjourObserver {
 public:
  KSBonjourObserver() = default;
  KSBonjourObserver(const KSBonjourObserver&) = delete;
  KSBonjourObserver& operator=(const KSBonjourObserver&) = delete;
  virtual ~KSBonjourObserver() = default;

  /// Called when a service is found, before it is resolved.
  virtual void addBonjourService(const NetServiceRef& service) = 0;
  /// Called when a service is reported gone, after the browser has updated its table. A service
  /// that was added more than once may still be in the table. `service` is the object that was in
  /// the table, or null if the table did not contain the service.
  virtual void removeBonjourService(const NetServiceRef& service) = 0;
  /// Called when a service's addresses and TXT record are known, after the browser has updated its
  /// table.
  virtual void resolvedBonjourService(const NetServiceRef& service) = 0;
};

/// Browses for services of one type, resolves each service that it finds, and keeps the services in
/// a table. A service that is found several times has one entry with a count. All functions must be
/// called on the main thread.
class KSBonjour {
 public:
  /// Creates an idle browser for `type`. If `type` has no value, the browser never starts.
  [[nodiscard]] static std::shared_ptr<KSBonjour> initWithType(std::optional<std::string> type);

  KSBonjour(const KSBonjour&) = delete;
  KSBonjour& operator=(const KSBonjour&) = delete;
  ~KSBonjour();

  [[nodiscard]] const std::optional<std::string>& type() const { return _type; }

  /// The browser keeps its observers alive and calls them in the order in which they were added.
  /// When called, an observer may remove itself or destroy the browser.
  void addKSBonjourObserver(std::shared_ptr<KSBonjourObserver> observer);
  void removeKSBonjourObserver(const KSBonjourObserver* observer);

  // Each of these functions calls the corresponding function of every observer.
  void notifyAddToKSBonjourObserver(const NetServiceRef& service) const;
  void notifyRemoveToKSBonjourObserver(const NetServiceRef& service) const;
  void notifyResolvedToKSBonjourObserver(const NetServiceRef& service) const;

  /// Starts to browse all domains that the computer is configured to browse. Stops first if the
  /// browser is running. The table is empty at first. If browsing cannot start, the browser still
  /// forwards the events of other browsers.
  void startBrowsing();

  /// Stops browsing, cancels the resolves of services for which didServiceResolved() is false, and
  /// discards the table. Does not call the observers. Does nothing when the browser is idle.
  void stopBrowsing();

  // These functions handle the three notifications above.
  void addKSNetService(const Notification& notification);
  void removeKSNetService(const Notification& notification);
  void resolvedKSNetService(const Notification& notification);

  /// Returns the table's key for a service, such as "Office Printer._ipp._tcp.local.".
  [[nodiscard]] static std::string keyForService(const std::string& name, const std::string& type,
                                                 const std::string& domain);

  // These functions look up a service in the table. They return false or null when the service is
  // not in the table or an argument has no value. didServiceResolved() also returns false when the
  // service has not been resolved since it was last added.
  [[nodiscard]] bool isServiceContained(const std::optional<std::string>& name,
                                        const std::optional<std::string>& type,
                                        const std::optional<std::string>& domain) const;
  [[nodiscard]] bool didServiceResolved(const std::optional<std::string>& name,
                                        const std::optional<std::string>& type,
                                        const std::optional<std::string>& domain) const;
  [[nodiscard]] NetServiceRef serviceWithName(const std::string& key) const;

 private:
  struct Entry {
    NetServiceRef service;
    int referenceCount = 0;    ///< additions, minus the removals made while isValid was true
    bool didResolved = false;  ///< whether the service has been resolved since its last addition
    bool isValid = true;       ///< false from a removal until the next addition or resolve
  };
  using Table = std::map<std::string, Entry>;

  explicit KSBonjour(std::optional<std::string> type);

  [[nodiscard]] std::optional<std::string> ownKeyOf(const NetServiceRef& service) const;
  [[nodiscard]] const Entry* find(const std::optional<std::string>& name,
                                  const std::optional<std::string>& type,
                                  const std::optional<std::string>& domain) const;

  std::optional<std::string> _type;
  std::vector<std::shared_ptr<KSBonjourObserver>> _aryObserver;
  NetServiceBrowserRef _browserRef;
  std::optional<Table> _services;
};

}  // namespace onramp
