#include "tests/bonjour/medium_stub.h"

#include "platform/bundle.h"
#include "platform/property_list.h"
#include "platform/system_version.h"

namespace onramp {

namespace testing_medium {

Medium& medium() {
  static Medium instance;
  return instance;
}

}  // namespace testing_medium

Bundle Bundle::main() {
  return Bundle("/medium/Onramp OSX.app");
}

std::optional<std::string> Bundle::infoString(std::string_view) const {
  return "resources";
}

std::optional<Dictionary> loadDictionary(const std::string&) {
  return Dictionary{{"CDInfo", "description"},
                    {"BonjourNetwork", testing_medium::medium().browsedType}};
}

std::optional<std::int32_t> gestaltSystemVersion() {
  return testing_medium::medium().systemVersion;
}

}  // namespace onramp
