#include "platform/system_version.h"

#include <algorithm>
#include <cstdlib>
#include <string_view>
#include <utility>

#include "base/value.h"
#include "platform/standin/stand_in_system.h"

namespace onramp {

namespace {

constexpr const char* kDefaultVersion = "10.15.7";

std::string& chosenVersion() {
  static std::string version;
  return version;
}

std::string runningVersion() {
  if (!chosenVersion().empty()) return chosenVersion();
  const char* const version = std::getenv("ONRAMP_SYSTEM_VERSION");
  return version && *version ? version : kDefaultVersion;
}

// Removes the beginning of `version` up to and including the next dot. Returns the number with
// which `version` began, limited to the range from 0 to `most`.
std::int64_t takeComponent(std::string_view& version, std::int64_t most) {
  const std::int64_t number = leadingInteger(version.substr(0, version.find('.')));
  version.remove_prefix(std::min(version.find('.'), version.size() - 1) + 1);
  return std::clamp<std::int64_t>(number, 0, most);
}

}  // namespace

void setSystemVersion(std::string version) {
  chosenVersion() = std::move(version);
}

std::optional<std::string> productVersion() {
  return runningVersion();
}

std::optional<std::int32_t> gestaltSystemVersion() {
  // With three dots at the end, even a version such as "10" has three components that end with a
  // dot.
  const std::string version = runningVersion() + "...";
  std::string_view rest = version;
  std::int64_t digits = takeComponent(rest, 9999);
  std::int32_t coded = 0;
  for (int shift = 8; digits > 0; digits /= 10, shift += 4)
    coded |= static_cast<std::int32_t>(digits % 10) << shift;
  const auto minor = static_cast<std::int32_t>(takeComponent(rest, 9));
  const auto bugFix = static_cast<std::int32_t>(takeComponent(rest, 9));
  return coded | minor << 4 | bugFix;
}

}  // namespace onramp
