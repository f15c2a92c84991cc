#pragma once

#include <cstddef>
#include <ostream>

#include "tools/check/report.h"

namespace onramp::check {

/// Writes the findings, then a description of what users will see, then a summary. If `width` is
/// not 0, `out` is a terminal of `width` columns: the findings are wrapped, the words "error:" and
/// "warning:" are coloured, and long names of models are cut. Otherwise each finding takes one
/// line.
void writeText(std::ostream& out, const Report& report, std::size_t width);

/// Writes the report as JSON in the form that the manual page onramp-check(1) describes. Bytes that
/// are not UTF-8 become replacement characters.
void writeJSON(std::ostream& out, const Report& report);

/// Writes a line for every key in keyGroups() (lists.h): the key's list, the kind of its value,
/// whether a medium needs it, and the path of keys.
void writeKeys(std::ostream& out);

/// Writes a line for every text that the wizard shows from the message bundle. The line has the
/// text's key, the room for the text, what is shown if the medium lacks the text, and where the
/// text is shown. If the text must contain "%@", the line also says how often.
void writeTexts(std::ostream& out);

}  // namespace onramp::check
