#pragma once

#include <cstdint>
#include <optional>
#include <string>
#include <string_view>

#include "base/value.h"

namespace onramp {

/// A file, given by its absolute path.
struct FileURL {
  std::string path;
  friend bool operator==(const FileURL&, const FileURL&) = default;
};

/// Returns the key of "PkgInfo" that names the package for the system version `version`, or nothing
/// when no key covers that version. `version` is in binary-coded decimal: 0x1068 is 10.6.8.
/// "PkgName" takes precedence over the keys that this function returns.
[[nodiscard]] std::optional<std::string_view> packageKey(std::int32_t version);

/// Where the installer package and the wireless set-up tool are on the medium, and which systems
/// the medium supports. Only the constructor reads the medium.
class KSInstallerInfo {
 public:
  /// Reads the medium that the application is on.
  KSInstallerInfo();

  /// Sets all values from the medium resource dictionary `common`, or to their defaults when
  /// `common` is nothing.
  void setCDCommonInfoValue(const std::optional<Dictionary>& common);

  // Each sets the value that it is named after.
  void loadPkgURL(const std::optional<Dictionary>& common);
  void loadSupportSystem(const std::optional<Dictionary>& common);
  void loadWLANToolURL(const std::optional<Dictionary>& common);

  /// The package to open; nothing when the medium has none for the running system.
  [[nodiscard]] const std::optional<FileURL>& pkgURL() const { return mPkgURL; }

  /// The path of the set-up tool's application bundle, which may not exist. When the medium
  /// resource dictionary names no tool, this is the folder that holds the application. Nothing when
  /// the dictionary could not be read.
  [[nodiscard]] const std::optional<FileURL>& WLANtoolURL() const { return mWLANToolURL; }

  /// The bounds of the supported system versions, as system_range.h explains them. Each is a
  /// dictionary with "Major", "Minor" and "BugFix", which are strings or numbers. A "Major" of 0,
  /// the default, means that there is no bound.
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
