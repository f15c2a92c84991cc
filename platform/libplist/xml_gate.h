#pragma once

#include <optional>
#include <string>

#include "base/parse_problem.h"

namespace onramp::libplist {

/// `text`, which is UTF-8 without a byte-order mark, in a form that libplist reads correctly and
/// within the limits: blanks replace the leading zeros of integers, which libplist would take for
/// octal numbers. Nothing when the markup exceeds the limits, or when libplist might parse it
/// differently from this check, such as a document type with an internal part; `problem` then says
/// why.
[[nodiscard]] std::optional<std::string> admittedXML(std::string text, ParseProblem& problem);

}  // namespace onramp::libplist
