#include "media/CommonMessage.h"

#include "media/medium.h"
#include "platform/bundle.h"

namespace onramp {

std::string CommonMessage::convertRelativePathToFullPath(
    const std::optional<std::string>& relativePath) {
  return medium::fullPath(relativePath);
}

std::string CommonMessage::localizedStringForKey(const std::string& key, const std::string& value,
                                                 const std::optional<std::string>& table) {
  const auto bundle =
      Bundle::open(convertRelativePathToFullPath("MacResources/CDCommonMessage.bundle"));
  return bundle ? bundle->localizedString(key, value, table) : value;
}

std::string localized(const std::string& key) {
  return localized(key, key);
}

std::string localized(const std::string& key, const std::string& fallback) {
  return CommonMessage::localizedStringForKey(key, fallback, std::nullopt);
}

}  // namespace onramp
