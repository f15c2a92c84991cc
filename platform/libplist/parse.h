#pragma once

#include <optional>
#include <string>

#include "base/value.h"

namespace onramp::libplist {

/// The value that a file's bytes hold as an XML (UTF-8 or UTF-16) or binary property list; nothing
/// when they hold none or go past the limits.
[[nodiscard]] std::optional<Value> parsePropertyList(std::string bytes);

/// `dictionary` as an XML property list.
[[nodiscard]] std::string formatPropertyList(const Dictionary& dictionary);

}  // namespace onramp::libplist
