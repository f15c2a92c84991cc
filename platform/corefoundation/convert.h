#pragma once

#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "base/value.h"
#include "platform/corefoundation/reference.h"

namespace onramp::corefoundation {

/// `text` as a string object; null when it is not valid UTF-8.
[[nodiscard]] Reference<CFStringRef> toCFString(std::string_view text);

/// `texts` as an array of string objects; those that are not valid UTF-8 are left out.
[[nodiscard]] Reference<CFArrayRef> toCFArray(const std::vector<std::string>& texts);

/// The object's text in UTF-8; nothing when it is null or no string.
[[nodiscard]] std::optional<std::string> toString(CFTypeRef object);

[[nodiscard]] Data toData(CFDataRef data);

/// A string, an array or a dictionary of these as a value. Members of other kinds are left out.
/// Nothing when the object is null or of another kind itself.
[[nodiscard]] std::optional<Value> toValue(CFTypeRef object);

}  // namespace onramp::corefoundation
