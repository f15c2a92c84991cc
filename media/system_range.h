#pragma once

#include <cstdint>
#include <string>
#include <vector>

#include "base/value.h"

namespace onramp {

/// A system's version, such as 10.15.7.
struct SystemVersion {
  std::int64_t major = 0;
  std::int64_t minor = 0;
  std::int64_t bugFix = 0;
};

/// The version with these components. A component that is missing, as in 10.9, or is not a number
/// counts as 0.
[[nodiscard]] SystemVersion systemVersion(const std::vector<std::string>& components);

/// How a system compares with the range that the medium supports.
enum class SystemSupport : std::uint32_t {
  kSupported = 0,
  kOlderThanMinimum = 1,
  kNewerThanMaximum = 2,
};

// The bounds are version dictionaries of KSInstallerInfo.

/// Whether `bound` sets a limit: one whose "Major" is 0 does not.
[[nodiscard]] bool isBound(const Dictionary& bound);

/// Whether `version` lies above `maximum`. The maximum's "BugFix" is the first release above it,
/// whereas its "Major" and "Minor" are still within it; "x" means that no release of that minor
/// version is above it.
[[nodiscard]] bool isNewerThan(const Dictionary& maximum, const SystemVersion& version);

/// Whether `version` lies below `minimum`.
[[nodiscard]] bool isOlderThan(const Dictionary& minimum, const SystemVersion& version);

/// How `version` compares with both bounds. The maximum is checked first.
[[nodiscard]] SystemSupport systemSupport(const SystemVersion& version, const Dictionary& minimum,
                                          const Dictionary& maximum);

}  // namespace onramp
