#pragma once

#include <plist/plist.h>

#include <memory>
#include <type_traits>

#include "base/value.h"

namespace onramp::libplist {

struct NodeFree {
  void operator()(plist_t node) const { plist_free(node); }
};

/// Owns a libplist node and everything below it.
using Node = std::unique_ptr<std::remove_pointer_t<plist_t>, NodeFree>;

/// Converts `node` to a value. As in an XML property list, a UID becomes a dictionary whose only
/// key is "CF$UID".
[[nodiscard]] Value valueOf(plist_t node);

/// Converts `value` to a node that XML can express. Malformed UTF-8 and characters that XML does
/// not allow become the replacement character. Dates are rounded down to whole seconds and clamped
/// to the years 1 to 9999. A date whose time is NaN becomes the reference date.
[[nodiscard]] Node nodeOf(const Value& value);

}  // namespace onramp::libplist
