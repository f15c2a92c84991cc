#pragma once

#include <optional>
#include <span>
#include <string>
#include <string_view>
#include <vector>

#include "base/value.h"
#include "tools/check/key_rules.h"
#include "tools/check/medium_files.h"

namespace onramp::check {

/// The keys that the wizard reads from one dictionary.
struct KeyGroup {
  std::string_view list;  ///< the usual name of the dictionary's file
  std::string_view path;  ///< the keys that lead to the dictionary, each followed by "/"
  std::span<const KeyRule> rules;
};

/// Returns the keys of all dictionaries that have rules. In a path, "NAME" is a placeholder for a
/// model's name.
[[nodiscard]] std::span<const KeyGroup> keyGroups();

/// The main property lists of a medium. A list that cannot be read has no value. All paths are
/// relative to the medium. A path that is not known is empty; an unknown `resourcesPath` is the
/// usual path.
struct Lists {
  std::string informationPath;  ///< of the application's Info.plist
  std::optional<Dictionary> information;
  std::string resourcesPath;  ///< of the resource dictionary, usually CDCommonInfo.plist
  std::optional<Dictionary> resources;
  std::string descriptionPath;  ///< of the medium description, usually CDInfo.plist
  std::optional<Dictionary> description;
  std::string modelsPath;  ///< of the model information, usually ModelInfo.plist
  std::optional<Dictionary> models;

  /// Returns the names of the medium's models in the order in which the wizard shows them.
  [[nodiscard]] std::vector<std::string> modelNames() const;

  /// Returns the place of `key` in the resource dictionary or, if `inner` is given, the place of
  /// `inner` in the dictionary under `key`.
  [[nodiscard]] Place resourcePlace(std::string_view key, std::string_view inner = "") const;

  /// Returns whether any model supports wireless.
  [[nodiscard]] bool anyWireless() const;
};

/// Reads the lists whose paths are known. Reports to files.report() why a list cannot be read,
/// which keys are unknown, misspelt or missing, and which values are of the wrong kind. If the
/// medium has no application, reads the resource dictionary at its usual path.
[[nodiscard]] Lists readLists(const MediumFiles& files);

}  // namespace onramp::check
