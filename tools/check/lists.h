#pragma once

#include <optional>
#include <string>
#include <vector>

#include "base/value.h"
#include "tools/check/medium_files.h"

namespace onramp::check {

/// The property lists that the wizard reads from a medium. A list that the wizard cannot read is
/// nothing.
struct Lists {
  std::string informationPath;  ///< like the other paths, relative to the medium; empty if unknown
  std::optional<Dictionary> information;  ///< the application's Info.plist
  std::string resourcesPath;
  std::optional<Dictionary> resources;
  std::string descriptionPath;
  std::optional<Dictionary> description;
  std::string modelsPath;
  std::optional<Dictionary> models;

  /// Returns the medium's models in the order in which the wizard shows them.
  [[nodiscard]] std::vector<std::string> modelNames() const;

  /// Returns whether any model supports wireless.
  [[nodiscard]] bool anyWireless() const;
};

/// Reads the lists. Reports mistakes in their keys and in the kinds of their values.
[[nodiscard]] Lists readLists(const MediumFiles& files);

}  // namespace onramp::check
