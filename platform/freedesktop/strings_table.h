#pragma once

#include <optional>
#include <string>
#include <string_view>

#include "base/parse_problem.h"
#include "base/value.h"

namespace onramp {

/// Returns the texts in the ".strings" file at `path`. The file is text in UTF-8 or UTF-16, or an
/// XML or binary property list. Returns nothing when the file cannot be read as any of these or
/// exceeds a limit in platform/property_list.h.
[[nodiscard]] std::optional<Dictionary> loadStringsTable(const std::string& path);

/// Parses the text of a strings file. The file consists of pairs `"key" = "text";` in the grammar
/// of old-style property lists, and may contain comments. A key without a text is its own text.
/// When a key occurs more than once, its last text counts. Returns nothing when any part of the
/// input violates the grammar, or when there are more pairs than a property list may have objects.
/// In this case, `problem` gets the place and the reason.
[[nodiscard]] std::optional<Dictionary> parseStrings(std::string_view text);
[[nodiscard]] std::optional<Dictionary> parseStrings(std::string_view text, ParseProblem& problem);

}  // namespace onramp
