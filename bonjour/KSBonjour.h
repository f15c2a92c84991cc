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

// What the browsers tell each other of, on the default notification centre, posted by no one in
// particular. All carry a NetServiceRef under kServiceInfo; add and remove carry the browse flags,
// an unsigned long, under kAddFlagInfo and kRemoveFlagsInfo.
inline constexpr std::string_view kAddNotification = "addNotificationInternal";
inline constexpr std::string_view kRemoveNotification = "removeNotificationInternal";
inline constexpr std::string_view kResolvedNotification = "resolveNotificationInternal";
inline constexpr std::string_view kServiceInfo = "service";
inline constexpr std::string_view kAddFlagInfo = "flag";
inline constexpr std::string_view kRemoveFlagsInfo = "flags";

/// Told what browsers find, of whatever type: every started browser forwards what all of them see.
/// A service may be null.
class KSBonjourObserver {
 public:
  KSBonjourObserver() = default;
  KSBonjourObserver(const KSBonjourObserver&) = delete;
  KSBonjourObserver& operator=(const KSBonjourObserver&) = delete;
  virtual ~KSBonjourObserver() = default;

  virtual void addBonjourService(const NetServiceRef& service) = 0;
  virtual void removeBonjourService(const NetServiceRef& service) = 0;
  virtual void resolvedBonjourService(const NetServiceRef& service) = 0;
};

/// Browses for services of one type, resolves each one found and keeps a table of them. A service
/// seen several times, say on two network interfaces, is one entry that counts how often. Main
/// thread only.
class KSBonjour {
 public:
  /// An idle browser for `type`; one without a type never starts.
  [[nodiscard]] static std::shared_ptr<KSBonjour> initWithType(std::optional<std::string> type);

  KSBonjour(const KSBonjour&) = delete;
  KSBonjour& operator=(const KSBonjour&) = delete;
  ~KSBonjour();

  [[nodiscard]] const std::optional<std::string>& type() const { return _type; }

  /// Observers are retained and told in the order in which they were added.
  void addKSBonjourObserver(std::shared_ptr<KSBonjourObserver> observer);
  void removeKSBonjourObserver(const KSBonjourObserver* observer);

  void notifyAddToKSBonjourObserver(const NetServiceRef& service) const;
  void notifyRemoveToKSBonjourObserver(const NetServiceRef& service) const;
  void notifyResolvedToKSBonjourObserver(const NetServiceRef& service) const;

  /// Starts with an empty table, anew if it runs already. A browse that cannot start leaves the
  /// browser idle.
  void startBrowsing();

  /// Ends the browse and forgets the table; observers are not told of it.
  void stopBrowsing();

  // Handlers of the three notifications.
  void addKSNetService(const Notification& notification);
  void removeKSNetService(const Notification& notification);
  void resolvedKSNetService(const Notification& notification);

  /// The table's key for a service, such as "Office Printer._ipp._tcp.local.".
  [[nodiscard]] static std::string keyForService(const std::string& name, const std::string& type,
                                                 const std::string& domain);

  // Answers from the table: false or null for whatever is not in it, and for a null text.
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
    bool isValid = true;  ///< false once a removal has hit the entry, until it is resolved anew
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
