#include <string_view>

#include "base/ascii.h"
#include "base/text.h"
#include "bonjour/KSNetService.h"
#include "bonjour/txt_record.h"

namespace onramp {

namespace {

struct IdentityKeys {
  std::string_view manufacturer;
  std::string_view model;
};

std::optional<IdentityKeys> identityKeysOf(const std::optional<std::string>& type) {
  if (type == "_pdl-datastream._tcp." || type == "_printer._tcp." || type == "_ipp._tcp.") {
    return IdentityKeys{"usb_MFG", "usb_MDL"};
  }
  if (type == "_scanner._tcp.") return IdentityKeys{"mfg", "mdl"};
  return std::nullopt;
}

std::optional<std::string> textUnder(const NetServiceRef& service, std::string_view key) {
  const auto data = service->txtData();
  if (!data) return std::nullopt;
  const auto record = TxtRecord::parse(*data);
  if (!record) return std::nullopt;
  auto value = record->value(key);
  if (value && !isUTF8(*value)) return std::nullopt;
  return value;
}

std::optional<std::string> identityText(const NetServiceRef& service,
                                        std::string_view IdentityKeys::*which) {
  if (!service) return std::nullopt;
  const auto keys = identityKeysOf(service->type());
  return keys ? textUnder(service, (*keys).*which) : std::nullopt;
}

}  // namespace

std::optional<std::string> KSNetServiceCopyModel(const NetServiceRef& service) {
  return identityText(service, &IdentityKeys::model);
}

std::optional<std::string> KSNetServiceCopyManufacturer(const NetServiceRef& service) {
  return identityText(service, &IdentityKeys::manufacturer);
}

std::optional<std::string> KSNetServiceCopyNote(const NetServiceRef& service) {
  return service ? textUnder(service, "note") : std::nullopt;
}

bool KSNetServiceSupportsURF(const NetServiceRef& service) {
  const auto languages = service ? textUnder(service, "pdl") : std::nullopt;
  return languages && asciiLowercased(*languages).find("image/urf") != std::string::npos;
}

}  // namespace onramp
