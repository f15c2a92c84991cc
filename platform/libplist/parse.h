#pragma once

#include <optional>
#include <string>

#include "base/parse_problem.h"
#include "base/value.h"

namespace onramp::libplist {

/// The value that a file's bytes hold as an XML (UTF-8 or UTF-16) or binary property list; nothing
/// when they hold none or go past the limits. The second form tells why; for markup that passes the
/// limits' check but not libplist, that is all it knows.
[[nodiscard]] std::optional<Value> parsePropertyList(std::string bytes);
[[nodiscard]] std::optional<Value> parsePropertyList(std::string bytes, ParseProblem& problem);

/// `dictionary` as an XML property list.
[[nodiscard]] std::string formatPropertyList(const Dictionary& dictionary);

}  // namespace onramp::libplist
