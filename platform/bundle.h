#pragma once

#include <optional>
#include <string>
#include <string_view>

#include "base/value.h"

namespace onramp {

/// A resource bundle: a folder that holds Contents/Info.plist and Contents/Resources. The resources
/// include one folder of string tables for each language. An application's bundle also holds the
/// executable, in a subfolder of Contents named after the operating system. A Bundle object stores
/// only the path, and every query reads the disk. However, macOS caches what it has read from a
/// bundle, so the running program may not see later changes to the bundle.
class Bundle {
 public:
  /// Returns the bundle of the running application.
  [[nodiscard]] static Bundle main();

  /// Opens the bundle at `path`. Returns nothing when `path` is not a folder.
  [[nodiscard]] static std::optional<Bundle> open(const std::string& path);

  /// Returns the absolute path of the bundle's folder, without a trailing "/".
  [[nodiscard]] const std::string& path() const { return path_; }

  /// Returns the information dictionary (Contents/Info.plist), or an empty dictionary when it is
  /// missing or cannot be read.
  [[nodiscard]] Dictionary infoDictionary() const;

  /// Returns the string under `key` in the information dictionary, or nothing when there is no
  /// value or the value is not a string.
  [[nodiscard]] std::optional<std::string> infoString(std::string_view key) const;

  /// Returns the string under `key` in the bundle's string table "InfoPlist". If there is none,
  /// returns the result of infoString().
  [[nodiscard]] std::optional<std::string> localizedInfoString(const std::string& key) const;

  /// Returns the path of the resource file `name`.`type`, or of the file `name` if `type` is empty.
  /// Searches these folders in this order:
  /// - the resources folder itself;
  /// - the folder for the user's most preferred language among those that the bundle offers (some
  ///   backends also search this language's folders for other regions);
  /// - the folder for the bundle's development language;
  /// - if the bundle has neither of these two language folders, the English folder;
  /// - if there is no English folder either, one of the bundle's other language folders.
  /// Returns nothing when none of these folders holds the file.
  [[nodiscard]] std::optional<std::string> pathForResource(const std::string& name,
                                                           const std::string& type) const;

  /// Returns the path of the bundle's executable. Returns nothing when the information dictionary
  /// names no executable and, on macOS, no executable has the bundle's name. If the file that the
  /// dictionary names does not exist, some backends return the path where it should be, and others
  /// return nothing.
  [[nodiscard]] std::optional<std::string> executablePath() const;

  /// Returns the string under `key` in the string table `table`, or in "Localizable" if `table` is
  /// not given. Returns `value` when the table does not contain `key` or cannot be read. The table
  /// is the file that pathForResource() finds for the table's name and the type "strings". Do not
  /// pass an empty `value`, because macOS would return `key` instead.
  [[nodiscard]] std::string localizedString(const std::string& key, const std::string& value,
                                            const std::optional<std::string>& table) const;

 private:
  explicit Bundle(std::string path) : path_(std::move(path)) {}

  std::string path_;
};

}  // namespace onramp
