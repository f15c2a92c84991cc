#include "bonjour/KSBonjour.h"

#include <any>
#include <utility>

#include "bonjour/KSNetService.h"

namespace onramp {

namespace {

void post(std::string_view name, UserInfo info) {
  NotificationCenter::defaultCenter().post({std::string(name), nullptr, std::move(info)});
}

void postAdd(const NetServiceRef& service, unsigned long flags) {
  post(kAddNotification,
       {{std::string(kServiceInfo), service}, {std::string(kAddFlagInfo), flags}});
}

void postRemove(const NetServiceRef& service, unsigned long flags) {
  post(kRemoveNotification,
       {{std::string(kServiceInfo), service}, {std::string(kRemoveFlagsInfo), flags}});
}

void postResolved(const NetServiceRef& service) {
  post(kResolvedNotification, {{std::string(kServiceInfo), service}});
}

// Returns the callbacks that all browsers of the process share. Each new browser sets them, always
// to the same three functions.
ServiceClientCallbacks& clientCallbacks() {
  static ServiceClientCallbacks callbacks;
  return callbacks;
}

NetServiceRef serviceIn(const Notification& notification) {
  const auto found = notification.userInfo.find(kServiceInfo);
  if (found == notification.userInfo.end()) return nullptr;
  const auto* const service = std::any_cast<NetServiceRef>(&found->second);
  return service ? *service : nullptr;
}

}  // namespace

std::shared_ptr<KSBonjour> KSBonjour::initWithType(std::optional<std::string> type) {
  return std::shared_ptr<KSBonjour>(new KSBonjour(std::move(type)));
}

KSBonjour::KSBonjour(std::optional<std::string> type) : _type(std::move(type)) {
  clientCallbacks() = {postAdd, postRemove, postResolved};
}

KSBonjour::~KSBonjour() {
  stopBrowsing();
}

void KSBonjour::addKSBonjourObserver(std::shared_ptr<KSBonjourObserver> observer) {
  _aryObserver.push_back(std::move(observer));
}

void KSBonjour::removeKSBonjourObserver(const KSBonjourObserver* observer) {
  std::erase_if(_aryObserver, [&](const auto& candidate) { return candidate.get() == observer; });
}

// An observer may remove itself when it is called, so each loop below iterates over a copy of the
// array.

void KSBonjour::notifyAddToKSBonjourObserver(const NetServiceRef& service) const {
  for (const auto& observer : std::vector(_aryObserver))
    observer->addBonjourService(service);
}

void KSBonjour::notifyRemoveToKSBonjourObserver(const NetServiceRef& service) const {
  for (const auto& observer : std::vector(_aryObserver))
    observer->removeBonjourService(service);
}

void KSBonjour::notifyResolvedToKSBonjourObserver(const NetServiceRef& service) const {
  for (const auto& observer : std::vector(_aryObserver))
    observer->resolvedBonjourService(service);
}

void KSBonjour::startBrowsing() {
  stopBrowsing();
  if (!_type) return;
  NotificationCenter& center = NotificationCenter::defaultCenter();
  center.addObserver(this, kAddNotification, [this](const auto& n) { addKSNetService(n); });
  center.addObserver(this, kRemoveNotification, [this](const auto& n) { removeKSNetService(n); });
  center.addObserver(this, kResolvedNotification,
                     [this](const auto& n) { resolvedKSNetService(n); });
  _services.emplace();
  KSNetServiceBrowserStart(_browserRef, "", _type, &clientCallbacks());
}

void KSBonjour::stopBrowsing() {
  KSNetServiceBrowserStop(_browserRef);
  if (_services) {
    for (const auto& [key, entry] : *_services) {
      if (!entry.didResolved) KSNetServiceCancelResolve(entry.service);
    }
  }
  _services.reset();
  _browserRef = nullptr;
  NotificationCenter::defaultCenter().removeObserver(this);
}

void KSBonjour::addKSNetService(const Notification& notification) {
  const NetServiceRef service = serviceIn(notification);
  if (const auto key = ownKeyOf(service)) {
    Entry& entry = (*_services)[*key];
    if (entry.service && entry.isValid) KSNetServiceCancelResolve(entry.service);
    entry = Entry{service, entry.referenceCount + 1, false, true};
    KSNetServiceResolveAsync(service, &clientCallbacks());
  }
  notifyAddToKSBonjourObserver(service);
}

void KSBonjour::removeKSNetService(const Notification& notification) {
  const NetServiceRef service = serviceIn(notification);
  KSNetServiceCancelResolve(service);
  const auto key = ownKeyOf(service);
  if (!key || !_services->contains(*key)) {
    notifyRemoveToKSBonjourObserver(nullptr);
    return;
  }
  const auto stored = _services->find(*key);
  Entry& entry = stored->second;
  // The table's object for this service may be newer than the one in the notification.
  const NetServiceRef storedService = entry.service;
  const bool wasValid = std::exchange(entry.isValid, false);
  if (wasValid) KSNetServiceCancelResolve(storedService);
  if (entry.referenceCount >= 2) {
    // Only the first removal after an addition or a resolve lowers the count. So, by design, an
    // entry that was added three or more times survives any number of removals with no addition or
    // resolve between them.
    if (wasValid) --entry.referenceCount;
    KSNetServiceResolveAsync(storedService, &clientCallbacks());
  } else {
    _services->erase(stored);
  }
  notifyRemoveToKSBonjourObserver(storedService);
}

void KSBonjour::resolvedKSNetService(const Notification& notification) {
  const NetServiceRef service = serviceIn(notification);
  if (const auto key = ownKeyOf(service)) {
    Entry& entry = (*_services)[*key];
    entry = Entry{service, entry.referenceCount, true, true};
  }
  notifyResolvedToKSBonjourObserver(service);
}

std::string KSBonjour::keyForService(const std::string& name, const std::string& type,
                                     const std::string& domain) {
  return name + '.' + type + domain;
}

// Returns the key of `service` in this browser's table. Returns nothing when the browser is
// stopped, and when the service is null, lacks a name, type or domain, or has a type other than the
// browser's.
std::optional<std::string> KSBonjour::ownKeyOf(const NetServiceRef& service) const {
  if (!service || !_services) return std::nullopt;
  const auto name = service->name();
  const auto type = service->type();
  const auto domain = service->domain();
  if (!name || !type || !domain || type != _type) return std::nullopt;
  return keyForService(*name, *type, *domain);
}

const KSBonjour::Entry* KSBonjour::find(const std::optional<std::string>& name,
                                        const std::optional<std::string>& type,
                                        const std::optional<std::string>& domain) const {
  if (!_services || !name || !type || !domain) return nullptr;
  const auto found = _services->find(keyForService(*name, *type, *domain));
  return found == _services->end() ? nullptr : &found->second;
}

bool KSBonjour::isServiceContained(const std::optional<std::string>& name,
                                   const std::optional<std::string>& type,
                                   const std::optional<std::string>& domain) const {
  return find(name, type, domain) != nullptr;
}

bool KSBonjour::didServiceResolved(const std::optional<std::string>& name,
                                   const std::optional<std::string>& type,
                                   const std::optional<std::string>& domain) const {
  const Entry* const entry = find(name, type, domain);
  return entry && entry->didResolved;
}

NetServiceRef KSBonjour::serviceWithName(const std::string& key) const {
  if (!_services) return nullptr;
  const auto found = _services->find(key);
  return found == _services->end() ? nullptr : found->second.service;
}

}  // namespace onramp
