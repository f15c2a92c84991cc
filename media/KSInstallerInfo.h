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

/// Returns the "PkgInfo" key of the package for a system version, which is given in binary-coded
/// decimal, or nothing when no key covers that version. "PkgName" takes precedence over these keys.
[[nodiscard]] std::optional<std::string_view> packageKey(std::int32_t version);

/// Where the installer package and the wireless set-up tool are on the medium, and which systems
/// the medium supports. The constructor reads the medium; nothing is read afterwards.
class KSInstallerInfo {
 public:
  /// Reads the medium that the application lies on.
  KSInstallerInfo();

  /// Sets everything from a medium resource dictionary, or to the defaults when there is none.
  void setCDCommonInfoValue(const std::optional<Dictionary>& common);

  // Each of these sets the part that it is named after.
  void loadPkgURL(const std::optional<Dictionary>& common);
  void loadSupportSystem(const std::optional<Dictionary>& common);
  void loadWLANToolURL(const std::optional<Dictionary>& common);

  /// The package to open; nothing when the medium has none for the running system.
  [[nodiscard]] const std::optional<FileURL>& pkgURL() const { return mPkgURL; }

  /// The set-up tool's application bundle, whether or not it is there; nothing when the medium's
  /// resource dictionary could not be read.
  [[nodiscard]] const std::optional<FileURL>& WLANtoolURL() const { return mWLANToolURL; }

  /// Version dictionaries with "Major", "Minor" and "BugFix", as strings or numbers. A "Major" of
  /// 0, which is the default, sets no bound.
  [[nodiscard]] const Dictionary& supportSystemMin() const { return mSystemMin; }
  [[nodiscard]] const Dictionary& supportSystemMax() const { return mSystemMax; }

  [[nodiscard]] static std::string convertRelativePathToFullPath(
      const std::optional<std::string>& relativePath);

 private:
  std::optional<FileURL> mPkgURL;
  std::optional<FileURL> mWLANToolURL;
  Dictionary mSystemMin;
  Dictionary mSystemMax;
};

}  // namespace onramp
