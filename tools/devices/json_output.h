#pragma once

#include <nlohmann/json.hpp>
#include <optional>
#include <string>
#include <vector>

#include "tools/devices/device.h"

namespace onramp::devices {

/// An answer and all its exchanges, in the form that the manual page describes.
[[nodiscard]] nlohmann::ordered_json jsonOfAnswer(const Answer& answer);

/// The name of an outcome in JSON.
[[nodiscard]] std::string outcomeName(Exchange::Outcome outcome);

/// The strings of a TXT record, such as "note=Attic", in their order, up to one that is cut off.
[[nodiscard]] std::vector<std::string> txtStrings(const std::optional<Data>& txt);

/// JSON as it is printed. Bytes that are no UTF-8 become U+FFFD.
[[nodiscard]] std::string printed(const nlohmann::ordered_json& json);

}  // namespace onramp::devices
