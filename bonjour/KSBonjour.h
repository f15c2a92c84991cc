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

// The notifications that browsers exchange on the default notification centre. They are posted
// without an object. All carry a NetServiceRef under kServiceInfo. kAddNotification and
// kRemoveNotification also carry the browse flags, an unsigned long: the first under kAddFlagInfo,
// the second under kRemoveFlagsInfo.
inline constexpr std::string_view kAddNotification = "addNotificationInternal";
inline constexpr std::string_view kRemoveNotification = "removeNotificationInternal";
inline constexpr std::string_view kResolvedNotification = "resolveNotificationInternal";
inline constexpr std::string_view kServiceInfo = "service";
inline constexpr std::string_view kAddFlagInfo = "flag";
inline constexpr std::string_view kRemoveFlagsInfo = "flags";

/// Receives the events of a browser. A running browser also forwards the events of all other
/// browsers, so the services may be of any type.
class KSBonjourObserver {
 public:
  KSBonjourObserver() = default;
  KSBonjourObserver(const KSBonjourObserver&) = delete;
  KSBonjourObserver& operator=(const KSBonjourObserver&) = delete;
  virtual ~KSBonjourObserver() = default;

  /// Called when a service is found, before it is resolved.
  virtual void addBonjourService(const NetServiceRef& service) = 0;
  /// Called when a service is reported gone, after the browser's table has been updated. A service
  /// that was added more than once may still be in the table. `service` is the table's object, or
  /// null when the table did not contain the service.
  virtual void removeBonjourService(const NetServiceRef& service) = 0;
  /// Called when a service's addresses and TXT record are known, after the browser's table has been
  /// updated.
  virtual void resolvedBonjourService(const NetServiceRef& service) = 0;
};

/// Browses for services of one type, resolves each service found and keeps a table of them. A
/// service that is reported several times has one entry, which counts the reports. All functions
/// must be called on the main thread.
class KSBonjour {
 public:
  /// Creates an idle browser for `type`. A browser without a type never starts to browse.
  [[nodiscard]] static std::shared_ptr<KSBonjour> initWithType(std::optional<std::string> type);

  KSBonjour(const KSBonjour&) = delete;
  KSBonjour& operator=(const KSBonjour&) = delete;
  ~KSBonjour();

  [[nodiscard]] const std::optional<std::string>& type() const { return _type; }

  /// Observers are retained and called in the order in which they were added. They may remove
  /// themselves or destroy the browser.
  void addKSBonjourObserver(std::shared_ptr<KSBonjourObserver> observer);
  void removeKSBonjourObserver(const KSBonjourObserver* observer);

  // Each calls the corresponding function of every observer.
  void notifyAddToKSBonjourObserver(const NetServiceRef& service) const;
  void notifyRemoveToKSBonjourObserver(const NetServiceRef& service) const;
  void notifyResolvedToKSBonjourObserver(const NetServiceRef& service) const;

  /// Starts browsing with an empty table. Stops first if the browser is running. When the browse
  /// cannot start, the browser finds nothing itself but still forwards the events of other
  /// browsers.
  void startBrowsing();

  /// Ends the browse and forgets the table, without calling observers. Does nothing when the
  /// browser is idle.
  void stopBrowsing();

  // Handlers of the three notifications.
  void addKSNetService(const Notification& notification);
  void removeKSNetService(const Notification& notification);
  void resolvedKSNetService(const Notification& notification);

  /// The table's key for a service, such as "Office Printer._ipp._tcp.local.".
  [[nodiscard]] static std::string keyForService(const std::string& name, const std::string& type,
                                                 const std::string& domain);

  // These functions look up a service in the table. They return false or null when the service is
  // not in the table or when an argument is nothing. didServiceResolved() also returns false when
  // the service has not been resolved since it was last added.
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
    int referenceCount = 0;    ///< additions, less the removals that counted
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
