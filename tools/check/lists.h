#pragma once

#include <optional>
#include <string>
#include <vector>

#include "base/value.h"
#include "tools/check/medium_files.h"

namespace onramp::check {

/// The property lists that the wizard reads from a medium. A list that the wizard cannot read is
/// nothing. All paths are relative to the medium, and are empty if unknown.
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

  /// Returns whether any model supports wireless.
  [[nodiscard]] bool anyWireless() const;
};

/// Reads the lists. Adds to files.report() why a list cannot be read, and mistakes in the lists'
/// keys and in the kinds of their values.
[[nodiscard]] Lists readLists(const MediumFiles& files);

}  // namespace onramp::check
