#pragma once

#include <nlohmann/json.hpp>
#include <optional>
#include <string>
#include <vector>

#include "tools/devices/device.h"

namespace onramp::devices {

/// Returns an answer and all its exchanges in the form that the manual page onramp-devices(1)
/// describes.
[[nodiscard]] nlohmann::ordered_json jsonOfAnswer(const Answer& answer);

/// Returns the name that an outcome has in JSON, such as "other-type".
[[nodiscard]] std::string outcomeName(Exchange::Outcome outcome);

/// Returns the strings, such as "note=Attic", of a TXT record in wire format (RFC 6763 section 6).
/// Omits the last string if it is cut off.
[[nodiscard]] std::vector<std::string> txtStrings(const std::optional<Data>& txt);

/// Returns `json` as indented text that ends with a line feed. Bytes that are not UTF-8 become
/// U+FFFD.
[[nodiscard]] std::string printed(const nlohmann::ordered_json& json);

}  // namespace onramp::devices
