#pragma once

#include <cstdint>
#include <optional>
#include <string>
#include <string_view>

#include "base/value.h"

namespace onramp {

/// The absolute path of a file or folder, which need not exist.
struct FileURL {
  std::string path;
  friend bool operator==(const FileURL&, const FileURL&) = default;
};

/// Returns the key that names the package for the system version `version`, or nothing when no key
/// covers that version. `version` is in binary-coded decimal: 0x1068 is 10.6.8. The key belongs to
/// the dictionary "PkgInfo" in the medium resource dictionary (media/medium.h). If "PkgInfo" has
/// the key "PkgName", the wizard uses only that key.
[[nodiscard]] std::optional<std::string_view> packageKey(std::int32_t version);

/// Says where the installer package and the wireless set-up tool are on the medium, and which
/// systems the medium supports. Only the constructor reads the medium.
class KSInstallerInfo {
 public:
  /// Reads the medium from which the wizard is running.
  KSInstallerInfo();

  /// Sets all values from the medium resource dictionary `common`. When `common` has no value, sets
  /// all values to their defaults.
  void setCDCommonInfoValue(const std::optional<Dictionary>& common);

  // setCDCommonInfoValue() calls these three functions.
  void loadPkgURL(const std::optional<Dictionary>& common);
  void loadSupportSystem(const std::optional<Dictionary>& common);
  void loadWLANToolURL(const std::optional<Dictionary>& common);

  /// The package to open, which may not exist. Has no value when the medium resource dictionary
  /// could not be read, or when its "PkgInfo" is missing or lacks the folder or the package name
  /// for the running system.
  [[nodiscard]] const std::optional<FileURL>& pkgURL() const { return mPkgURL; }

  /// The path of the set-up tool's application bundle, which may not exist. When the medium
  /// resource dictionary names no tool, this is the folder that holds the wizard. Has no value when
  /// the dictionary could not be read.
  [[nodiscard]] const std::optional<FileURL>& WLANtoolURL() const { return mWLANToolURL; }

  /// The bounds of the supported system versions. system_range.h defines how they are compared.
  /// Each bound is a dictionary with "Major", "Minor" and "BugFix", which are strings or numbers. A
  /// key that the medium omits counts as 0. A "Major" of 0, the default, means that there is no
  /// bound.
  [[nodiscard]] const Dictionary& supportSystemMin() const { return mSystemMin; }
  [[nodiscard]] const Dictionary& supportSystemMax() const { return mSystemMax; }

  /// Returns medium::fullPath(relativePath).
  [[nodiscard]] static std::string convertRelativePathToFullPath(
      const std::optional<std::string>& relativePath);

 private:
  std::optional<FileURL> mPkgURL;
  std::optional<FileURL> mWLANToolURL;
  Dictionary mSystemMin;
  Dictionary mSystemMax;
};

}  // namespace onramp
