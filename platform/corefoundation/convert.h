#pragma once

#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "base/value.h"
#include "platform/corefoundation/reference.h"

namespace onramp::corefoundation {

/// Converts `text` to a CFString. Returns null when `text` is not valid UTF-8.
[[nodiscard]] Reference<CFStringRef> toCFString(std::string_view text);

/// Converts `texts` to an array of CFStrings. Leaves out strings that are not valid UTF-8.
[[nodiscard]] Reference<CFArrayRef> toCFArray(const std::vector<std::string>& texts);

/// Returns the contents of a CFString in UTF-8. Returns nothing when `object` is null or is not a
/// CFString.
[[nodiscard]] std::optional<std::string> toString(CFTypeRef object);

/// Returns a copy of the bytes of `data`, which must not be null.
[[nodiscard]] Data toData(CFDataRef data);

/// Converts a string, an array or a dictionary to a value. Returns nothing when `object` is null or
/// of another kind. Leaves out items of other kinds, and pairs whose keys are not strings.
[[nodiscard]] std::optional<Value> toValue(CFTypeRef object);

}  // namespace onramp::corefoundation
