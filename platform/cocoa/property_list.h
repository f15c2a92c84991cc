#pragma once

#import <Foundation/Foundation.h>

#include <optional>

#include "base/value.h"

namespace onramp::cocoa {

/// Converts a property-list object to a dictionary. Leaves out members that are no property-list
/// objects. Nothing when it is no dictionary, or exceeds the limits of nesting depth, number of
/// objects, and bytes of texts and data.
[[nodiscard]] std::optional<Dictionary> toDictionary(id object);

/// `value` as a property-list object.
[[nodiscard]] id toPropertyList(const Value& value);

}  // namespace onramp::cocoa
