#pragma once

#include <optional>
#include <string>
#include <string_view>

#include "base/parse_problem.h"
#include "base/value.h"

namespace onramp {

/// Returns the texts in the ".strings" file at `path`. The file may be text in UTF-8 or UTF-16, or
/// an XML or binary property list. Returns nothing when the file cannot be read, is malformed, or
/// exceeds a limit in platform/property_list.h.
[[nodiscard]] std::optional<Dictionary> loadStringsTable(const std::string& path);

/// Parses the content of a ".strings" file: comments, and pairs `"key" = "text";` in the grammar of
/// old-style property lists. If a key has no text, the key is also the text. When a key occurs
/// more than once, the last text is used. Returns nothing when the content violates the grammar or
/// has more than kMostPropertyListObjects pairs. In that case, stores the place and the reason in
/// `problem`, if given.
[[nodiscard]] std::optional<Dictionary> parseStrings(std::string_view text);
[[nodiscard]] std::optional<Dictionary> parseStrings(std::string_view text, ParseProblem& problem);

}  // namespace onramp
