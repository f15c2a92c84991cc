#pragma once

#import <Foundation/Foundation.h>

#include <optional>

#include "base/value.h"

namespace onramp::cocoa {

/// Converts an NSDictionary to a Dictionary. Leaves out members that are not property-list objects
/// or whose keys are not strings. Returns nothing when `object` is nil, is not an NSDictionary or
/// exceeds the limits in platform/property_list.h.
[[nodiscard]] std::optional<Dictionary> toDictionary(id object);

/// Converts `value` to an autoreleased property-list object. A string that is not valid UTF-8
/// becomes an empty string.
[[nodiscard]] id toPropertyList(const Value& value);

}  // namespace onramp::cocoa
