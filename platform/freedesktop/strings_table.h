#pragma once

#include <optional>
#include <string>
#include <string_view>

#include "base/parse_problem.h"
#include "base/value.h"

namespace onramp {

/// The texts in the ".strings" file at `path`, which is text in UTF-8 or UTF-16, or an XML or
/// binary property list. Nothing when it cannot be read as any of these, or is larger than a
/// property list may be.
[[nodiscard]] std::optional<Dictionary> loadStringsTable(const std::string& path);

/// The pairs in a strings file's text: `"key" = "text";` in the grammar of old-style property
/// lists, with comments. A key without a text is its own text; the last of several texts for a key
/// counts. Nothing when the text breaks the grammar anywhere; the second form says where and how.
[[nodiscard]] std::optional<Dictionary> parseStrings(std::string_view text);
[[nodiscard]] std::optional<Dictionary> parseStrings(std::string_view text, ParseProblem& problem);

}  // namespace onramp
