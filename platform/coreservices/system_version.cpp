#include "platform/system_version.h"

#include <CoreServices/CoreServices.h>

#include "platform/property_list.h"

namespace onramp {

std::optional<std::string> productVersion() {
  const auto version = loadDictionary("/System/Library/CoreServices/SystemVersion.plist");
  return version ? version->string("ProductVersion") : std::nullopt;
}

std::optional<std::int32_t> gestaltSystemVersion() {
  SInt32 version = 0;
  if (Gestalt(::gestaltSystemVersion, &version) != noErr) return std::nullopt;
  return version;
}

}  // namespace onramp
