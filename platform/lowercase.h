#pragma once

#include <string>

namespace onramp {

/// Returns the UTF-8 text with all letters of every alphabet in lower case, whatever the user's
/// language is. Characters that are not letters stay unchanged. The result for malformed UTF-8
/// depends on the backend.
[[nodiscard]] std::string lowercaseString(const std::string& text);

}  // namespace onramp
