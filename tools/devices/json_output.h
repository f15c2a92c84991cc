#pragma once

#include <nlohmann/json.hpp>
#include <optional>
#include <string>
#include <vector>

#include "tools/devices/device.h"

namespace onramp::devices {

/// Returns an answer and all its exchanges in the form that the manual page describes.
[[nodiscard]] nlohmann::ordered_json jsonOfAnswer(const Answer& answer);

/// Returns an outcome's name in JSON.
[[nodiscard]] std::string outcomeName(Exchange::Outcome outcome);

/// Returns the strings of a TXT record, such as "note=Attic", in order. Stops at a string that is
/// cut off.
[[nodiscard]] std::vector<std::string> txtStrings(const std::optional<Data>& txt);

/// Returns the text of `json`. Bytes that are not UTF-8 become U+FFFD.
[[nodiscard]] std::string printed(const nlohmann::ordered_json& json);

}  // namespace onramp::devices
