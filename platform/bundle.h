#pragma once

#include <optional>
#include <string>
#include <string_view>

#include "base/value.h"

namespace onramp {

/// A folder laid out as a resource bundle. It holds Contents/Info.plist, Contents/Resources with
/// one folder of string tables per language, and for an application its executable in a folder
/// named after the system. The object stores only the path, and every query reads the disk. macOS,
/// however, caches what it has read of a bundle, so bundles must not change while the program runs.
class Bundle {
 public:
  /// The bundle of the running application.
  [[nodiscard]] static Bundle main();

  /// Opens the bundle at `path`. Returns nothing when `path` is not a folder.
  [[nodiscard]] static std::optional<Bundle> open(const std::string& path);

  /// The absolute path of the bundle's folder, without a trailing "/".
  [[nodiscard]] const std::string& path() const { return path_; }

  /// The information dictionary; empty when the bundle has none.
  [[nodiscard]] Dictionary infoDictionary() const;

  /// The string under `key` in the information dictionary; nothing when it is absent or of another
  /// kind.
  [[nodiscard]] std::optional<std::string> infoString(std::string_view key) const;

  /// As infoString(), but in the user's language if the bundle's string table "InfoPlist" has the
  /// key.
  [[nodiscard]] std::optional<std::string> localizedInfoString(const std::string& key) const;

  /// Returns the path of the resource file `name`.`type`, where an empty `type` means a name
  /// without an extension. A file outside the language folders takes precedence over the user's
  /// language. Returns nothing when the bundle has no such file.
  [[nodiscard]] std::optional<std::string> pathForResource(const std::string& name,
                                                           const std::string& type) const;

  /// The path of the bundle's program, whether or not such a file exists; nothing when the
  /// information dictionary names no program.
  [[nodiscard]] std::optional<std::string> executablePath() const;

  /// The text under `key` in the string table `table` ("Localizable" when none is given), or
  /// `value` when the table has no such key. The table is the one for the user's most preferred
  /// language that the bundle offers. When it offers none of them, the bundle's development
  /// language decides, then English, then any language that the bundle has.
  [[nodiscard]] std::string localizedString(const std::string& key, const std::string& value,
                                            const std::optional<std::string>& table) const;

 private:
  explicit Bundle(std::string path) : path_(std::move(path)) {}

  std::string path_;
};

}  // namespace onramp
