#pragma once

#include <cstddef>
#include <ostream>

#include "tools/check/report.h"

namespace onramp::check {

/// Writes a line for every finding, then a description of what users will see, then a summary. On a
/// terminal of `width` columns, the findings are wrapped and have coloured marks. A width of 0
/// means that the output is not a terminal.
void writeText(std::ostream& out, const Report& report, std::size_t width);

/// Writes the report as JSON, in the form that onramp-check(1) describes. Bytes that are not UTF-8
/// become replacement characters.
void writeJSON(std::ostream& out, const Report& report);

/// Writes a line for every key that the wizard reads from a medium's lists: its list, the kind of
/// its value, whether it is needed, and its path.
void writeKeys(std::ostream& out);

/// Writes a line for every text that the wizard shows: its key, the room that it has, what is
/// shown when it is missing, and where it is shown.
void writeTexts(std::ostream& out);

}  // namespace onramp::check
