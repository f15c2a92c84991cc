#include "bonjour/KSNetService.h"

#include <chrono>
#include <cstddef>
#include <cstdint>

#include "platform/ipv4.h"

namespace onramp {

namespace {

// NetService::addressing() returns socket addresses in the BSD layout on every system. These
// constants are the offset of the address family, the offset and the size of an IPv4 address, and
// the number of the IPv4 family.
constexpr std::size_t kFamilyOffset = 1;
constexpr std::size_t kIPv4Offset = 4;
constexpr std::size_t kIPv4Size = 4;
constexpr std::byte kIPv4Family{2};

IPv4Address addressAt(const std::byte* bytes) {
  IPv4Address address;
  for (std::size_t i = 0; i < kIPv4Size; ++i)
    address.bits = address.bits << 8U | std::to_integer<std::uint32_t>(bytes[i]);
  return address;
}

}  // namespace

int KSNetServiceBrowserStart(NetServiceBrowserRef& browser, const std::string& domain,
                             const std::optional<std::string>& type,
                             ServiceClientCallbacks* callbacks) {
  if (!type) return 1;
  browser = NetServiceBrowser::create(KSNetServiceBrowseCallBack, callbacks);
  if (!browser) return 1;
  browser->schedule();
  if (browser->searchForServices(domain, *type)) return 0;
  browser->unschedule();
  browser = nullptr;
  return 1;
}

int KSNetServiceBrowserStop(const NetServiceBrowserRef& browser) {
  if (!browser) return 1;
  browser->invalidate();
  browser->unschedule();
  browser->stopSearch();
  return 0;
}

void KSNetServiceBrowseCallBack(const NetServiceBrowserRef&, unsigned long flags,
                                const NetServiceRef& service, const NetServiceError& error,
                                void* info) {
  if (error.code != 0 || !info) return;
  const auto& callbacks = *static_cast<const ServiceClientCallbacks*>(info);
  const auto slot = (flags & kNetServiceFlagRemove) != 0 ? callbacks.remove : callbacks.add;
  if (slot) slot(service, flags);
}

int KSNetServiceCancelResolve(const NetServiceRef& service) {
  if (!service) return 1;
  service->unschedule();
  service->setClient(nullptr, nullptr);
  service->cancel();
  return 0;
}

int KSNetServiceResolveAsync(const NetServiceRef& service, ServiceClientCallbacks* callbacks) {
  if (!service) return 1;
  KSNetServiceCancelResolve(service);
  service->setClient(KSNetServiceResolveCallBack, callbacks);
  service->schedule();
  service->resolveWithTimeout(std::chrono::seconds(0));
  return 0;
}

void KSNetServiceResolveCallBack(const NetServiceRef& service, const NetServiceError& error,
                                 void* info) {
  KSNetServiceCancelResolve(service);
  auto* const callbacks = static_cast<ServiceClientCallbacks*>(info);
  if (error.code != 0) {
    KSNetServiceResolveAsync(service, callbacks);
  } else if (callbacks && callbacks->resolved) {
    callbacks->resolved(service);
  }
}

int KSNetServiceResolveSync(const NetServiceRef& service, double timeout) {
  if (!service) return 1;
  KSNetServiceCancelResolve(service);
  const bool resolved = service->resolveWithTimeout(std::chrono::duration<double>(timeout));
  service->cancel();
  return resolved ? 0 : 1;
}

int KSNetServiceCreateAndResolve(const std::optional<std::string>& name,
                                 const std::optional<std::string>& type,
                                 const std::optional<std::string>& domain,
                                 std::optional<std::vector<std::string>>* addresses,
                                 double timeout) {
  if (!addresses || !name || !type || !domain) return 1;
  const NetServiceRef service = NetService::create(*domain, *type, *name, 0);
  const int status = KSNetServiceResolveSync(service, timeout);
  if (status == 0) *addresses = KSNetServiceCopyIPv4Addresses(service);
  return status;
}

std::optional<std::vector<std::string>> KSNetServiceCopyIPv4Addresses(
    const NetServiceRef& service) {
  if (!service) return std::nullopt;
  std::vector<std::string> addresses;
  for (const Data& address : service->addressing()) {
    if (address.size() < kIPv4Offset + kIPv4Size || address[kFamilyOffset] != kIPv4Family) continue;
    addresses.push_back(dottedIPv4(addressAt(address.data() + kIPv4Offset)));
  }
  if (addresses.empty()) return std::nullopt;
  return addresses;
}

std::optional<std::string> KSNetServiceGetNameSafe(const NetServiceRef& service) {
  return service ? service->name() : std::nullopt;
}

}  // namespace onramp
