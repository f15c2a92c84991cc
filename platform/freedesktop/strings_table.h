#pragma once

#include <optional>
#include <string>
#include <string_view>

#include "base/parse_problem.h"
#include "base/value.h"

namespace onramp {

/// The texts of the ".strings" file at `path`: text in UTF-8 or UTF-16, or an XML or binary
/// property list. Nothing when it cannot be read as one of them, or is larger than a property list
/// may be.
[[nodiscard]] std::optional<Dictionary> loadStringsTable(const std::string& path);

/// The pairs of a strings file's text: `"key" = "text";` in the grammar of old-style property
/// lists, with comments. A key without a text stands for itself; of several texts for a key the
/// last one counts. Nothing when the text breaks the grammar anywhere; the second form tells where
/// and how.
[[nodiscard]] std::optional<Dictionary> parseStrings(std::string_view text);
[[nodiscard]] std::optional<Dictionary> parseStrings(std::string_view text, ParseProblem& problem);

}  // namespace onramp
