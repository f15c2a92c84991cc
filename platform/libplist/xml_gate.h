#pragma once

#include <string>

#include "base/parse_problem.h"

namespace onramp::libplist {

/// Whether `text` (UTF-8 without a byte-order mark) is markup that libplist can read within the
/// limits. Markup that libplist might take apart in another way than the check does, such as
/// document types with an internal part, is refused. Integers lose their leading zeros on the way,
/// because libplist would read those as octal. `problem` learns why a text is refused.
[[nodiscard]] bool mayReadXML(std::string& text, ParseProblem& problem);

}  // namespace onramp::libplist
