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
// without a sender. All carry a NetServiceRef under kServiceInfo. Add and remove carry the browse
// flags, an unsigned long, under kAddFlagInfo and kRemoveFlagsInfo.
inline constexpr std::string_view kAddNotification = "addNotificationInternal";
inline constexpr std::string_view kRemoveNotification = "removeNotificationInternal";
inline constexpr std::string_view kResolvedNotification = "resolveNotificationInternal";
inline constexpr std::string_view kServiceInfo = "service";
inline constexpr std::string_view kAddFlagInfo = "flag";
inline constexpr std::string_view kRemoveFlagsInfo = "flags";

/// Receives what browsers find, whatever its type, because every started browser forwards the
/// events of all of them.
class KSBonjourObserver {
 public:
  KSBonjourObserver() = default;
  KSBonjourObserver(const KSBonjourObserver&) = delete;
  KSBonjourObserver& operator=(const KSBonjourObserver&) = delete;
  virtual ~KSBonjourObserver() = default;

  /// Called when a service is found, before it is resolved.
  virtual void addBonjourService(const NetServiceRef& service) = 0;
  /// Called when a service is gone, after the table has been updated. An entry that is still
  /// counted stays there. `service` is the table's object, or null when the browser's table has
  /// none.
  virtual void removeBonjourService(const NetServiceRef& service) = 0;
  /// Called when a service's addresses and texts are known, after the table has been updated.
  virtual void resolvedBonjourService(const NetServiceRef& service) = 0;
};

/// Browses for services of one type, resolves each one found and keeps a table of them. A service
/// that is reported several times is one entry, which counts how often. Main thread only.
class KSBonjour {
 public:
  /// Creates an idle browser for `type`. One without a type never starts.
  [[nodiscard]] static std::shared_ptr<KSBonjour> initWithType(std::optional<std::string> type);

  KSBonjour(const KSBonjour&) = delete;
  KSBonjour& operator=(const KSBonjour&) = delete;
  ~KSBonjour();

  [[nodiscard]] const std::optional<std::string>& type() const { return _type; }

  /// Observers are retained and called in the order in which they were added. They may remove
  /// themselves or destroy the browser.
  void addKSBonjourObserver(std::shared_ptr<KSBonjourObserver> observer);
  void removeKSBonjourObserver(const KSBonjourObserver* observer);

  // Each calls the operation of that name on every observer.
  void notifyAddToKSBonjourObserver(const NetServiceRef& service) const;
  void notifyRemoveToKSBonjourObserver(const NetServiceRef& service) const;
  void notifyResolvedToKSBonjourObserver(const NetServiceRef& service) const;

  /// Starts with an empty table, after stopping if it runs. A browse that cannot start leaves the
  /// browser idle.
  void startBrowsing();

  /// Ends the browse and forgets the table without calling observers.
  void stopBrowsing();

  // Handlers of the three notifications.
  void addKSNetService(const Notification& notification);
  void removeKSNetService(const Notification& notification);
  void resolvedKSNetService(const Notification& notification);

  /// The table's key for a service, such as "Office Printer._ipp._tcp.local.".
  [[nodiscard]] static std::string keyForService(const std::string& name, const std::string& type,
                                                 const std::string& domain);

  // What the table says: false or null for what is not in it, and for a null text.
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
    int referenceCount = 0;    ///< adds outstanding for the key
    bool didResolved = false;  ///< a resolve has completed
    bool isValid = true;       ///< false from a removal until the next resolve has completed
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
