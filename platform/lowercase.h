#pragma once

#include <string>

namespace onramp {

/// The UTF-8 text with every letter made small, of whatever alphabet and in whatever language the
/// user works. What is no letter, or not well formed, stays as it is.
[[nodiscard]] std::string lowercaseString(const std::string& text);

}  // namespace onramp
