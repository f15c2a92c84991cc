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

/// Returns the version with these components. A component counts as 0 if it does not begin with a
/// number or is missing, like the third component of 10.9.
[[nodiscard]] SystemVersion systemVersion(const std::vector<std::string>& components);

/// How a system version compares with the range that the medium supports.
enum class SystemSupport : std::uint32_t {
  kSupported = 0,
  kOlderThanMinimum = 1,
  kNewerThanMaximum = 2,
};

// The functions below take bounds in the form that KSInstallerInfo returns. A missing key counts as
// 0.

/// Whether `bound` sets a limit, that is, whether its "Major" is not 0. isNewerThan() and
/// isOlderThan() do not check this.
[[nodiscard]] bool isBound(const Dictionary& bound);

/// Whether `version` is above `maximum`. The maximum's "Major" and "Minor" are inclusive. Its
/// "BugFix" is exclusive: the bug-fix release with this number is itself too new. A "BugFix" of "x"
/// or "X" allows every bug-fix release of the maximum's minor version.
[[nodiscard]] bool isNewerThan(const Dictionary& maximum, const SystemVersion& version);

/// Whether `version` is below `minimum`.
[[nodiscard]] bool isOlderThan(const Dictionary& minimum, const SystemVersion& version);

/// Returns how `version` compares with the range from `minimum` to `maximum`. Checks `maximum`
/// first. Skips a bound that sets no limit.
[[nodiscard]] SystemSupport systemSupport(const SystemVersion& version, const Dictionary& minimum,
                                          const Dictionary& maximum);

}  // namespace onramp
