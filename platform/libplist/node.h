#pragma once

#include <plist/plist.h>

#include <memory>
#include <type_traits>

#include "base/value.h"

namespace onramp::libplist {

struct NodeFree {
  void operator()(plist_t node) const { plist_free(node); }
};

/// A libplist node with everything below it.
using Node = std::unique_ptr<std::remove_pointer_t<plist_t>, NodeFree>;

/// The value of `node`. A UID becomes what an XML list has for it: a dictionary whose only key is
/// "CF$UID".
[[nodiscard]] Value valueOf(plist_t node);

/// A node for `value`, in a form that XML can express: characters that XML does not allow become
/// the replacement character, and dates are limited to the years 1 to 9999.
[[nodiscard]] Node nodeOf(const Value& value);

}  // namespace onramp::libplist
