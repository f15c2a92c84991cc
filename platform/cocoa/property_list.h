#pragma once

#import <Foundation/Foundation.h>

#include <optional>

#include "base/value.h"

namespace onramp::cocoa {

/// The property-list object as a dictionary; nothing when it is none, or goes past the limits of
/// nesting depth, number of objects and bytes of texts and data.
[[nodiscard]] std::optional<Dictionary> toDictionary(id object);

/// `value` as a property-list object.
[[nodiscard]] id toPropertyList(const Value& value);

}  // namespace onramp::cocoa
