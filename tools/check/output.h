#pragma once

#include <ostream>

#include "tools/check/report.h"

namespace onramp::check {

/// Writes a line for every finding, then what users will see, then a summary.
void writeText(std::ostream& out, const Report& report);

/// Writes the report as JSON, in the form that onramp-check(1) describes. Bytes that are not UTF-8
/// become replacement characters.
void writeJSON(std::ostream& out, const Report& report);

/// Writes the keys of all texts that the wizard shows, a line each, with the room that they have.
void writeTexts(std::ostream& out);

}  // namespace onramp::check
