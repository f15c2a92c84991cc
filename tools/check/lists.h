#pragma once

#include <optional>
#include <string>
#include <vector>

#include "base/value.h"
#include "tools/check/medium_files.h"

namespace onramp::check {

/// The property lists that the wizard reads from a medium. A list is nothing when the wizard cannot
/// read it.
struct Lists {
  std::string informationPath;            ///< relative to the medium, like the other paths
  std::optional<Dictionary> information;  ///< the application's
  std::string resourcesPath;
  std::optional<Dictionary> resources;
  std::string descriptionPath;
  std::optional<Dictionary> description;
  std::string modelsPath;
  std::optional<Dictionary> models;

  /// The models of the medium in the wizard's order.
  [[nodiscard]] std::vector<std::string> modelNames() const;

  /// Whether any model supports wireless.
  [[nodiscard]] bool anyWireless() const;
};

/// Reads the lists and reports what is wrong with their keys and the kinds of their values.
[[nodiscard]] Lists readLists(const MediumFiles& files);

}  // namespace onramp::check
