#pragma once

#include <optional>
#include <string>
#include <string_view>

#include "base/value.h"

namespace onramp {

/// A folder laid out as a resource bundle: Contents/Info.plist, Contents/Resources with one folder
/// of string tables per language, and for an application its executable in a folder named after the
/// system. The class stores nothing but the path and reads the disk for every answer. Some systems,
/// such as macOS, cache what they have read of a bundle, so a bundle must not be changed while the
/// program runs.
class Bundle {
 public:
  /// The running application's own bundle.
  [[nodiscard]] static Bundle main();

  /// The bundle at `path`; nothing when no folder lies there.
  [[nodiscard]] static std::optional<Bundle> open(const std::string& path);

  /// Absolute path of the bundle's folder, without a closing "/".
  [[nodiscard]] const std::string& path() const { return path_; }

  /// The information dictionary; empty when the bundle has none.
  [[nodiscard]] Dictionary infoDictionary() const;

  /// The information dictionary's text under `key` if it is a string.
  [[nodiscard]] std::optional<std::string> infoString(std::string_view key) const;

  /// The same in the user's language where the bundle's string table "InfoPlist" has the key.
  [[nodiscard]] std::optional<std::string> localizedInfoString(const std::string& key) const;

  /// Path of the resource `name` with the extension `type` (without its dot; empty for none), or
  /// nothing when the bundle holds no such file.
  [[nodiscard]] std::optional<std::string> pathForResource(const std::string& name,
                                                           const std::string& type) const;

  /// Path of the bundle's program, whether or not a file lies there; nothing when the bundle does
  /// not name one.
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
