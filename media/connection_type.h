#pragma once

#include <optional>
#include <string>
#include <vector>

#include "base/value.h"

namespace onramp {

/// The interfaces other than wireless that a model supports, or that several models have in common.
enum class ConnectionType : unsigned char {
  kNeither = 0,  ///< neither USB nor wired Ethernet, or the models disagree
  kEthernet = 2,
  kUSB = 3,
  kUSBAndEthernet = 4,
};

[[nodiscard]] ConnectionType connectionType(bool usb, bool ethernet);

/// Returns the type of the model with the KSOROSXModel record `model`. A flag that is missing from
/// the record counts as false.
[[nodiscard]] ConnectionType connectionType(const Dictionary& model);

/// Returns the type that all of `models` share according to `modelInfo`; kNeither when any two
/// differ or there are none.
[[nodiscard]] ConnectionType sharedConnectionType(const std::vector<std::string>& models,
                                                  const std::optional<Dictionary>& modelInfo);

/// Whether at least one of `models` supports wireless according to `modelInfo`.
[[nodiscard]] bool anySupportsWiFi(const std::vector<std::string>& models,
                                   const std::optional<Dictionary>& modelInfo);

/// The page that the wizard begins with.
enum class FirstPage {
  kNone,  ///< none: no model supports wireless, so the package opens at once
  kConnectionType,
  kModelList,
};

[[nodiscard]] FirstPage firstPage(const std::vector<std::string>& models,
                                  const std::optional<Dictionary>& modelInfo);

}  // namespace onramp
