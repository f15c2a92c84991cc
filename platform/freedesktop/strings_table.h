#pragma once

#include <optional>
#include <string>
#include <string_view>

#include "base/parse_problem.h"
#include "base/value.h"

namespace onramp {

/// Returns the texts in the ".strings" file at `path`. The file is text in UTF-8 or UTF-16, or an
/// XML or binary property list. Returns nothing when the file cannot be read as any of these or is
/// larger than a property list may be.
[[nodiscard]] std::optional<Dictionary> loadStringsTable(const std::string& path);

/// The pairs in a strings file's text: `"key" = "text";` in the grammar of old-style property
/// lists, with comments. A key without a text stands for itself; when a key has several texts, the
/// last one counts. Returns nothing when the input breaks the grammar anywhere; the form with
/// `problem` then says where and how.
[[nodiscard]] std::optional<Dictionary> parseStrings(std::string_view text);
[[nodiscard]] std::optional<Dictionary> parseStrings(std::string_view text, ParseProblem& problem);

}  // namespace onramp
