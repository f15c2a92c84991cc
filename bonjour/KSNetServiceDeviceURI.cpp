#include <cstddef>
#include <cstdint>
#include <string_view>

#include "bonjour/KSNetService.h"
#include "bonjour/device_uri.h"
#include "platform/host_lookup.h"
#include "platform/system_version.h"

namespace onramp {

namespace {

constexpr std::int32_t kSystem10_2 = 0x1020;
constexpr std::int32_t kSystem10_6 = 0x1060;
constexpr std::size_t kLongestHostName = 1024;

std::optional<std::string> addressOfHostIn(std::string_view url) {
  const auto host = hostOfURL(url);
  if (!host || host->size() > kLongestHostName) return std::nullopt;
  return lookUpIPv4Address(*host);
}

}  // namespace

std::string KSNetServiceCreateDeviceURI(const std::string& name, const std::string& type,
                                        const std::string& domain) {
  const bool old = gestaltSystemVersion().value_or(kSystem10_2) < kSystem10_6;
  std::string uri = old ? "mdns://" : "dnssd://";
  uri += percentEscaped(name) + '.' + type + domain;
  if (type == "_pdl-datastream._tcp.") uri += "/?bidi";
  return uri;
}

std::optional<std::string> KSNetServiceCopyDeviceURI(const NetServiceRef& service) {
  if (!service) return std::nullopt;
  return KSNetServiceCreateDeviceURI(service->name().value_or(""), service->type().value_or(""),
                                     service->domain().value_or(""));
}

int KSNetServiceCopyAddressesForDeviceURI(const std::optional<std::string>& uri,
                                          std::optional<std::vector<std::string>>* addresses,
                                          double timeout) {
  if (!uri || !addresses || uri->starts_with("usb://")) return 1;
  if (uri->starts_with("dnssd://") || uri->starts_with("mdns://")) {
    const auto instance = serviceInstanceOf(*uri);
    if (!instance) return 1;
    return KSNetServiceCreateAndResolve(instance->name, instance->type, instance->domain, addresses,
                                        timeout);
  }
  const auto address = addressOfHostIn(*uri);
  if (!address) return 1;
  *addresses = std::vector{*address};
  return 0;
}

}  // namespace onramp
