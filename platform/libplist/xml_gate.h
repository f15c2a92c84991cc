#pragma once

#include <optional>
#include <string>

#include "base/parse_problem.h"

namespace onramp::libplist {

/// Returns `text`, an XML property list in UTF-8 without a byte-order mark, in a form that libplist
/// reads correctly. Spaces replace the leading zeros of integers, because libplist would read an
/// integer with leading zeros as octal. Returns nothing when `text` exceeds the limits in
/// platform/property_list.h or would take libplist too many steps. Also returns nothing for a null
/// character, for containers that are not properly nested, and for markup that libplist might parse
/// differently from this check, such as a document type with an internal part. When the result is
/// nothing, `problem` gives the place and the reason.
[[nodiscard]] std::optional<std::string> admittedXML(std::string text, ParseProblem& problem);

}  // namespace onramp::libplist
