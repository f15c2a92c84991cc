#pragma once

#include <array>
#include <cstdint>
#include <optional>
#include <string>

#include "media/KSInstallerInfo.h"
#include "media/system_range.h"
#include "tools/check/lists.h"

namespace onramp::check {

/// The major, minor and bug-fix numbers of a system's version.
using Version = std::array<std::int64_t, 3>;

/// Returns the version that the dictionary `bound` ("SystemMin" or "SystemMax") names.
[[nodiscard]] Version boundOf(const Dictionary& bound);

/// Returns the version with dots, such as "10.13.4". Omits the last number of a major version's
/// first release, as in "11.0".
[[nodiscard]] std::string dotted(const Version& version);

/// Returns whether `text` consists of one or more digits.
[[nodiscard]] bool isVersionNumber(const std::string& text);

/// Returns the oldest system on which the application starts. Returns nothing if the application's
/// Info.plist does not name one.
[[nodiscard]] std::optional<SystemVersion> applicationsMinimum(const Lists& lists);

/// The range of systems on which the wizard accepts the medium.
class SupportedRange {
 public:
  /// `lists.resources` must have a value.
  explicit SupportedRange(const Lists& lists);

  /// Returns "SystemMin". The result is empty if the medium does not have it.
  [[nodiscard]] const Dictionary& minimum() const { return info_.supportSystemMin(); }
  /// Returns "SystemMax". The result is empty if the medium does not have it.
  [[nodiscard]] const Dictionary& maximum() const { return info_.supportSystemMax(); }

  [[nodiscard]] bool contains(const Version& version) const;

  /// Returns the first version of the range. Without a lower bound, this is 0.0.0.
  [[nodiscard]] Version begin() const;

  /// Returns the first version above the range. Returns nothing when the range has no upper bound.
  [[nodiscard]] std::optional<Version> end() const;

  /// Returns whether the maximum includes every bug-fix release of its minor version.
  [[nodiscard]] bool takesAllBugFixes() const;

  /// Returns a part of the range, from `from` to `to`, in words, such as "10.13.0 up to, but not
  /// including, 13.0". Without `to`, the part has no upper bound.
  [[nodiscard]] std::string words(const Version& from, const std::optional<Version>& to) const;

  /// Returns the whole range in words.
  [[nodiscard]] std::string words() const { return words(begin(), end()); }

 private:
  KSInstallerInfo info_;
};

}  // namespace onramp::check
