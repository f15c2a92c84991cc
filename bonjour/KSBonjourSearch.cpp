#include "bonjour/KSBonjourSearch.h"

#include <algorithm>
#include <utility>

#include "base/notification_center.h"
#include "bonjour/KSDevice.h"
#include "media/KSOROSXCD.h"

namespace onramp {

namespace {

struct Identity {
  explicit Identity(const NetServiceRef& service) {
    if (!service) return;
    type = service->type();
    name = service->name();
    domain = service->domain();
  }
  [[nodiscard]] bool complete() const { return type && name && domain; }

  std::optional<std::string> type;
  std::optional<std::string> name;
  std::optional<std::string> domain;
};

}  // namespace

std::shared_ptr<KSBonjourSearch> KSBonjourSearch::init() {
  return std::shared_ptr<KSBonjourSearch>(new KSBonjourSearch);
}

KSBonjourSearch::~KSBonjourSearch() {
  stopBrowsing();
}

void KSBonjourSearch::addKSDeviceObserver(std::shared_ptr<KSDeviceObserver> observer) {
  _aryObserver.push_back(std::move(observer));
}

void KSBonjourSearch::removeKSDeviceObserver(const KSDeviceObserver* observer) {
  std::erase_if(_aryObserver, [&](const auto& candidate) { return candidate.get() == observer; });
}

// An observer may remove itself when it is called, so each loop below iterates over a copy of the
// array.

void KSBonjourSearch::notifyAddToKSDeviceObserver(const Dictionary& device) const {
  for (const auto& observer : std::vector(_aryObserver))
    observer->addKSDevice(device);
}

void KSBonjourSearch::notifyUpdateToKSDeviceObserver(const Dictionary& device) const {
  for (const auto& observer : std::vector(_aryObserver))
    observer->updateKSDevice(device);
}

void KSBonjourSearch::notifyRemoveToKSDeviceObserver(const Dictionary& device) const {
  for (const auto& observer : std::vector(_aryObserver))
    observer->removeKSDevice(device);
}

void KSBonjourSearch::startBrowsing() {
  const auto type = KSOROSXCD::initWithCDInfo().string(KSOROSXCD::kBonjourServiceType);
  stopBrowsing();
  const auto browser = KSBonjour::initWithType(type);
  browser->addKSBonjourObserver(shared_from_this());
  browser->startBrowsing();
  _aryKSBonjour.push_back(browser);
}

// Stopped browsers stay in the array, where they do no harm because they have no table.
void KSBonjourSearch::stopBrowsing() {
  NotificationCenter::defaultCenter().removeObserver(this);
  // The browsers may hold the last references to this search, so `self` keeps it alive until this
  // function returns.
  const auto self = weak_from_this().lock();
  for (const auto& browser : _aryKSBonjour) {
    browser->stopBrowsing();
    browser->removeKSBonjourObserver(this);
  }
}

Array KSBonjourSearch::supportTypes(const std::optional<std::string>& name,
                                    const std::optional<std::string>& domain) const {
  Array types;
  for (const auto& browser : _aryKSBonjour) {
    if (browser->isServiceContained(name, browser->type(), domain)) {
      types.emplace_back(*browser->type());
    }
  }
  return types;
}

void KSBonjourSearch::addBonjourService(const NetServiceRef&) {}

void KSBonjourSearch::resolvedBonjourService(const NetServiceRef& service) {
  const Identity id(service);
  const Dictionary record = KSDevice::initWithService(service, supportTypes(id.name, id.domain));
  if (!id.complete()) return;
  const bool known = std::any_of(_aryKSBonjour.begin(), _aryKSBonjour.end(), [&](const auto& b) {
    return b->isServiceContained(id.name, id.type, id.domain) &&
           b->didServiceResolved(id.name, id.type, id.domain);
  });
  // The browser has already stored the service as resolved, so `known` is nearly always true.
  if (known) {
    notifyUpdateToKSDeviceObserver(record);
  } else {
    notifyAddToKSDeviceObserver(record);
  }
}

void KSBonjourSearch::removeBonjourService(const NetServiceRef& service) {
  const Identity id(service);
  const Dictionary record = KSDevice::initWithService(service, supportTypes(id.name, id.domain));
  if (!id.complete()) return;
  const bool stillHeld = std::any_of(
      _aryKSBonjour.begin(), _aryKSBonjour.end(),
      [&](const auto& b) { return b->isServiceContained(id.name, id.type, id.domain); });
  if (stillHeld) {
    notifyUpdateToKSDeviceObserver(record);
  } else {
    notifyRemoveToKSDeviceObserver(record);
  }
}

}  // namespace onramp
