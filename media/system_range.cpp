#include "media/system_range.h"

#include "base/ascii.h"

namespace onramp {

SystemVersion systemVersion(const std::vector<std::string>& components) {
  const auto component = [&](std::size_t index) {
    return index < components.size() ? leadingInteger(components[index]) : 0;
  };
  return {component(0), component(1), component(2)};
}

bool isBound(const Dictionary& bound) {
  return bound.integerValue("Major") != 0;
}

bool isNewerThan(const Dictionary& maximum, const SystemVersion& version) {
  const std::int64_t major = maximum.integerValue("Major");
  if (version.major != major) return version.major > major;
  const std::int64_t minor = maximum.integerValue("Minor");
  if (version.minor != minor) return version.minor > minor;
  if (asciiLowercased(maximum.string("BugFix").value_or("")) == "x") return false;
  return version.bugFix >= maximum.integerValue("BugFix");
}

bool isOlderThan(const Dictionary& minimum, const SystemVersion& version) {
  const std::int64_t major = minimum.integerValue("Major");
  if (version.major != major) return version.major < major;
  const std::int64_t minor = minimum.integerValue("Minor");
  if (version.minor != minor) return version.minor < minor;
  return version.bugFix < minimum.integerValue("BugFix");
}

SystemSupport systemSupport(const SystemVersion& version, const Dictionary& minimum,
                            const Dictionary& maximum) {
  if (isBound(maximum) && isNewerThan(maximum, version)) return SystemSupport::kNewerThanMaximum;
  if (isBound(minimum) && isOlderThan(minimum, version)) return SystemSupport::kOlderThanMinimum;
  return SystemSupport::kSupported;
}

}  // namespace onramp
