#pragma once

#include <optional>
#include <string>

#include "base/parse_problem.h"
#include "base/value.h"

namespace onramp::libplist {

/// Returns the value in `bytes`, an XML property list (in UTF-8 or UTF-16) or a binary one. Returns
/// nothing when `bytes` are malformed or exceed a limit. In that case, stores the place and the
/// reason in `problem`, if given. `bytes` are checked before libplist parses them. If only libplist
/// finds a fault, `problem` stays empty.
[[nodiscard]] std::optional<Value> parsePropertyList(std::string bytes);
[[nodiscard]] std::optional<Value> parsePropertyList(std::string bytes, ParseProblem& problem);

/// Formats `dictionary` as an XML property list. Returns an empty string on failure.
[[nodiscard]] std::string formatPropertyList(const Dictionary& dictionary);

}  // namespace onramp::libplist
