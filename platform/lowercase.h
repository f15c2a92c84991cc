#pragma once

#include <string>

namespace onramp {

/// Returns `text` (UTF-8) with the letters of all alphabets in lower case. The result does not
/// depend on the user's language, except with the backend freedesktop on a system without the
/// locale C.UTF-8. Characters without a lower-case form stay unchanged. The result for malformed
/// UTF-8 depends on the backend.
[[nodiscard]] std::string lowercaseString(const std::string& text);

}  // namespace onramp
