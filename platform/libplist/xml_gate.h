#pragma once

#include <optional>
#include <string>

#include "base/parse_problem.h"

namespace onramp::libplist {

/// Checks `text`, an XML property list in UTF-8 without a byte-order mark, and returns it in a form
/// that libplist reads correctly. In this form, spaces replace the leading zeros of integers,
/// because libplist would read an integer with leading zeros as octal. Returns nothing in these
/// cases:
/// - `text` exceeds the limits in platform/property_list.h or would take libplist too many steps;
/// - `text` has a null character, unfinished markup or containers that are not properly nested;
/// - `text` has markup that libplist might parse differently from this check, such as a document
///   type with an internal subset.
/// In these cases, stores the place and the reason in `problem`.
[[nodiscard]] std::optional<std::string> admittedXML(std::string text, ParseProblem& problem);

}  // namespace onramp::libplist
