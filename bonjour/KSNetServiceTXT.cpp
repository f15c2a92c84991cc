#include <string_view>

#include "base/ascii.h"
#include "base/text.h"
#include "bonjour/KSNetService.h"
#include "bonjour/identity_keys.h"
#include "bonjour/txt_record.h"

namespace onramp {

namespace {

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
  const auto type = service->type();
  const auto keys = type ? identityKeysOf(*type) : std::nullopt;
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
