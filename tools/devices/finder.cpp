#include "tools/devices/finder.h"

#include <algorithm>

#include "bonjour/KSDevice.h"
#include "bonjour/ipv6_addresses.h"

namespace onramp::devices {

namespace {

// Browsing this type finds the types of all announced services (RFC 6763 section 9). For example,
// "_ipp._tcp." is found as a service whose name is "_ipp" and whose type starts with "_tcp.".
constexpr const char* kTypeOfTypes = "_services._dns-sd._udp.";

}  // namespace

Finder::Finder(std::string preferred, Changed changed)
    : preferred_(std::move(preferred)), changed_(std::move(changed)) {}

void Finder::start(const std::vector<std::string>& types, bool all) {
  start_ = std::chrono::steady_clock::now();
  for (const std::string& type : types)
    browsers_.push_back(KSBonjour::initWithType(type));
  // Every browser also reports what the other browsers find, so it is enough to observe one.
  if (!browsers_.empty()) browsers_.front()->addKSBonjourObserver(shared_from_this());
  watchSightings([this](const ServiceSighting& sighting) { sighted(sighting); });
  for (const auto& browser : browsers_)
    browser->startBrowsing();
  typeBrowser_ = all ? NetServiceBrowser::create(typeFound, this) : nullptr;
  if (!typeBrowser_) return;
  typeBrowser_->schedule();
  typeBrowser_->searchForServices("", kTypeOfTypes);
}

void Finder::typeFound(const NetServiceBrowserRef& /*browser*/, unsigned long flags,
                       const NetServiceRef& service, const NetServiceError& error, void* self) {
  if (error.code != 0 || !service || (flags & kNetServiceFlagRemove) != 0) return;
  const std::string protocol = service->type().value_or("");
  static_cast<Finder*>(self)->browse(service->name().value_or("") + '.' +
                                     protocol.substr(0, protocol.find('.')) + '.');
}

void Finder::browse(const std::string& type) {
  const bool isBrowsed = std::any_of(browsers_.begin(), browsers_.end(),
                                     [&](const auto& browser) { return browser->type() == type; });
  if (isBrowsed) return;
  browsers_.push_back(KSBonjour::initWithType(type));
  browsers_.back()->startBrowsing();
}

void Finder::stop() {
  const auto self = shared_from_this();
  watchSightings(nullptr);
  if (typeBrowser_) typeBrowser_->invalidate();
  for (const auto& browser : browsers_) {
    browser->stopBrowsing();
    browser->removeKSBonjourObserver(this);
  }
}

void Finder::sighted(const ServiceSighting& sighting) {
  const std::pair key(sighting.name, sighting.domain);
  auto& places = sightings_[key];
  const std::string place = sighting.interface + (sighting.isIPv6 ? " IPv6" : " IPv4");
  if (sighting.isGone) {
    places.erase(place);
  } else {
    places.insert(place);
  }
  const auto device = devices_.find(key);
  if (device != devices_.end()) device->second.sightings = places;
}

std::vector<Device*> Finder::devices() {
  std::vector<Device*> all;
  for (auto& [key, device] : devices_)
    all.push_back(&device);
  return all;
}

double Finder::now() const {
  return std::chrono::duration<double>(std::chrono::steady_clock::now() - start_).count();
}

Device* Finder::deviceOf(const NetServiceRef& service) {
  if (!service || !service->name() || !service->type() || !service->domain()) return nullptr;
  const auto [entry, isNew] = devices_.try_emplace({*service->name(), *service->domain()});
  Device& device = entry->second;
  if (isNew) {
    device.name = *service->name();
    device.domain = *service->domain();
    device.type = *service->type();
    device.found = now();
    device.sightings = sightings_[entry->first];
  }
  return &device;
}

void Finder::addBonjourService(const NetServiceRef& service) {
  Device* const device = deviceOf(service);
  if (!device) return;
  const std::string type = *service->type();
  if (std::find(device->types.begin(), device->types.end(), type) == device->types.end()) {
    device->types.push_back(type);
  }
  if (type == preferred_ && device->type != preferred_) {
    device->type = type;
    device->resolved.reset();
  }
  device->gone.reset();
  changed_(*device);
}

void Finder::removeBonjourService(const NetServiceRef& service) {
  Device* const device = deviceOf(service);
  if (!device) return;
  const std::string key = KSBonjour::keyForService(device->name, *service->type(), device->domain);
  const bool isStillThere = std::any_of(browsers_.begin(), browsers_.end(), [&](const auto& b) {
    return b->serviceWithName(key) != nullptr;
  });
  if (isStillThere) return;
  std::erase(device->types, *service->type());
  if (device->types.empty()) device->gone = now();
  changed_(*device);
}

void Finder::resolvedBonjourService(const NetServiceRef& service) {
  Device* const device = deviceOf(service);
  if (!device || device->type != *service->type()) return;
  Array types;
  for (const std::string& type : device->types)
    types.emplace_back(type);
  device->record = KSDevice::initWithService(service, types);
  device->txt = service->txtData();
  device->ipv6 = ipv6AddressesOf(service);
  if (!device->resolved) device->resolved = now();
  changed_(*device);
}

}  // namespace onramp::devices
