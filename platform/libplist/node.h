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

/// The value that `node` stands for. A UID becomes what an XML list has in its place: a dictionary
/// with the one key "CF$UID".
[[nodiscard]] Value valueOf(plist_t node);

/// A node for `value`, fit for writing: what XML has no way to say is put into the nearest form
/// that it has. Characters that may not stand in XML become the replacement character, and dates
/// are kept within the years 1 to 9999.
[[nodiscard]] Node nodeOf(const Value& value);

}  // namespace onramp::libplist
