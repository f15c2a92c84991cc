#pragma once

#include <optional>
#include <string>
#include <string_view>

#include "base/value.h"

namespace onramp {

/// A folder laid out as a resource bundle. The folder holds Contents/Info.plist and
/// Contents/Resources, which has one folder of string tables for each language. In an application,
/// a folder in Contents that is named after the operating system holds the executable. This object
/// stores only the path, and every query reads the disk. macOS, however, caches what it has read of
/// a bundle, so a change to a bundle may go unnoticed while the program runs.
class Bundle {
 public:
  /// Returns the bundle of the running application.
  [[nodiscard]] static Bundle main();

  /// Opens the bundle at `path`. Returns nothing when `path` is not a folder.
  [[nodiscard]] static std::optional<Bundle> open(const std::string& path);

  /// Returns the absolute path of the bundle's folder, without a trailing "/".
  [[nodiscard]] const std::string& path() const { return path_; }

  /// Returns the information dictionary, or an empty dictionary when the bundle has none that can
  /// be read.
  [[nodiscard]] Dictionary infoDictionary() const;

  /// Returns the string under `key` in the information dictionary, or nothing when there is no
  /// value or the value is not a string.
  [[nodiscard]] std::optional<std::string> infoString(std::string_view key) const;

  /// Like infoString(), but returns the text under `key` in the bundle's string table "InfoPlist"
  /// if there is one.
  [[nodiscard]] std::optional<std::string> localizedInfoString(const std::string& key) const;

  /// Returns the path of the resource file `name`.`type`, where an empty `type` means a name
  /// without an extension. The search starts outside the language folders. It continues in the
  /// folder of the user's most preferred language that the bundle offers, and then in that of the
  /// bundle's development language. If the bundle offers neither language, the search continues in
  /// the folder of English, or in that of one other language when the bundle does not offer
  /// English. Returns nothing when the search finds no such file.
  [[nodiscard]] std::optional<std::string> pathForResource(const std::string& name,
                                                           const std::string& type) const;

  /// Returns the path of the bundle's program. Returns nothing when the information dictionary
  /// names no program. If the file does not exist, some backends return the path that it should
  /// have, and others return nothing.
  [[nodiscard]] std::optional<std::string> executablePath() const;

  /// Returns the text under `key` in the string table `table` ("Localizable" when no table is
  /// given), or `value` when the table does not contain `key` or cannot be read. The table is the
  /// file that pathForResource() finds for the name of the table and the type "strings". `value`
  /// should not be empty, because macOS returns `key` in place of an empty `value`.
  [[nodiscard]] std::string localizedString(const std::string& key, const std::string& value,
                                            const std::optional<std::string>& table) const;

 private:
  explicit Bundle(std::string path) : path_(std::move(path)) {}

  std::string path_;
};

}  // namespace onramp
