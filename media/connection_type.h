#pragma once

#include <optional>
#include <string>
#include <vector>

#include "base/value.h"

namespace onramp {

/// The wired connections that a model supports, or that each of several models supports.
enum class ConnectionType : unsigned char {
  kNeither = 0,  ///< neither USB nor Ethernet, or the models differ
  kEthernet = 2,
  kUSB = 3,
  kUSBAndEthernet = 4,
};

/// Returns the type of a model. `usb` and `ethernet` say whether the model supports USB and wired
/// Ethernet.
[[nodiscard]] ConnectionType connectionType(bool usb, bool ethernet);

/// Returns the type of the model with the KSOROSXModel record `model`. A flag that is missing from
/// the record counts as false.
[[nodiscard]] ConnectionType connectionType(const Dictionary& model);

/// Returns the type that all of `models` share according to `modelInfo`, the result of
/// KSOROSXModel::modelInfo(). Returns kNeither when any two models differ, or when there are no
/// models.
[[nodiscard]] ConnectionType sharedConnectionType(const std::vector<std::string>& models,
                                                  const std::optional<Dictionary>& modelInfo);

/// Whether at least one of `models` supports wireless according to `modelInfo`.
[[nodiscard]] bool anySupportsWiFi(const std::vector<std::string>& models,
                                   const std::optional<Dictionary>& modelInfo);

/// The page that the wizard shows first.
enum class FirstPage {
  kNone,  ///< no page: no model supports wireless, so the installer package opens at once
  kConnectionType,
  kModelList,
};

/// Returns the first page for a medium with `models`, according to `modelInfo`: kNone when no model
/// supports wireless, kConnectionType when the models share a type other than kNeither, and
/// otherwise kModelList.
[[nodiscard]] FirstPage firstPage(const std::vector<std::string>& models,
                                  const std::optional<Dictionary>& modelInfo);

}  // namespace onramp
