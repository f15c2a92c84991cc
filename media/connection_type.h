#pragma once

#include <optional>
#include <string>
#include <vector>

#include "base/value.h"

namespace onramp {

/// The interfaces that a model, or all models of the medium, support besides wireless.
enum class ConnectionType : unsigned char {
  kNeither = 0,  ///< neither USB nor wired Ethernet, or the models disagree
  kEthernet = 2,
  kUSB = 3,
  kUSBAndEthernet = 4,
};

[[nodiscard]] ConnectionType connectionType(bool usb, bool ethernet);

/// The type of a KSOROSXModel record. A flag that is missing from the record counts as false.
[[nodiscard]] ConnectionType connectionType(const Dictionary& model);

/// The type that all of the models share by the model information; kNeither when any two differ.
[[nodiscard]] ConnectionType sharedConnectionType(const std::vector<std::string>& models,
                                                  const std::optional<Dictionary>& modelInfo);

/// Whether at least one of the models supports wireless by the model information.
[[nodiscard]] bool anySupportsWiFi(const std::vector<std::string>& models,
                                   const std::optional<Dictionary>& modelInfo);

/// What the wizard begins with.
enum class FirstPage {
  kNone,  ///< no model supports wireless: the package opens at once
  kConnectionType,
  kModelList,
};

[[nodiscard]] FirstPage firstPage(const std::vector<std::string>& models,
                                  const std::optional<Dictionary>& modelInfo);

}  // namespace onramp
