#pragma once

#include <optional>
#include <string>

#include "base/parse_problem.h"
#include "base/value.h"

namespace onramp::libplist {

/// The value in the bytes of an XML (UTF-8 or UTF-16) or binary property list; nothing when they
/// hold none or exceed the limits. The second form says why. It cannot say where libplist itself
/// failed.
[[nodiscard]] std::optional<Value> parsePropertyList(std::string bytes);
[[nodiscard]] std::optional<Value> parsePropertyList(std::string bytes, ParseProblem& problem);

/// `dictionary` as an XML property list.
[[nodiscard]] std::string formatPropertyList(const Dictionary& dictionary);

}  // namespace onramp::libplist
