#pragma once

#include <optional>
#include <string>
#include <string_view>

#include "base/value.h"

namespace onramp {

/// A folder laid out as a resource bundle. It holds Contents/Info.plist, Contents/Resources with
/// one folder of string tables per language, and, for an application, its executable in a folder
/// named after the operating system. This object stores only the path, and every query reads the
/// disk. macOS, however, caches what it has read of a bundle, so bundles must not change while the
/// program runs.
class Bundle {
 public:
  /// Returns the bundle of the running application.
  [[nodiscard]] static Bundle main();

  /// Opens the bundle at `path`. Returns nothing when `path` is not a folder.
  [[nodiscard]] static std::optional<Bundle> open(const std::string& path);

  /// Returns the absolute path of the bundle's folder, without a trailing "/".
  [[nodiscard]] const std::string& path() const { return path_; }

  /// Returns the information dictionary, which is empty when the bundle has none.
  [[nodiscard]] Dictionary infoDictionary() const;

  /// Returns the string under `key` in the information dictionary, or nothing when there is no
  /// value or the value is not a string.
  [[nodiscard]] std::optional<std::string> infoString(std::string_view key) const;

  /// Like infoString(), but returns the text in the user's language if the bundle's string table
  /// "InfoPlist" contains `key`.
  [[nodiscard]] std::optional<std::string> localizedInfoString(const std::string& key) const;

  /// Returns the path of the resource file `name`.`type`, where an empty `type` means a name
  /// without an extension. A file outside the language folders takes precedence over one inside
  /// them. Returns nothing when the bundle has no such file.
  [[nodiscard]] std::optional<std::string> pathForResource(const std::string& name,
                                                           const std::string& type) const;

  /// Returns the path of the bundle's program, whether or not such a file exists. Returns nothing
  /// when the information dictionary names no program.
  [[nodiscard]] std::optional<std::string> executablePath() const;

  /// Returns the text under `key` in the string table `table` ("Localizable" when no table is
  /// given), or `value` when the table does not contain `key`. The table is taken from the folder
  /// of the user's most preferred language that the bundle offers. If the bundle offers none of the
  /// user's languages, its development language is used, then English, then any language that it
  /// has.
  [[nodiscard]] std::string localizedString(const std::string& key, const std::string& value,
                                            const std::optional<std::string>& table) const;

 private:
  explicit Bundle(std::string path) : path_(std::move(path)) {}

  std::string path_;
};

}  // namespace onramp
