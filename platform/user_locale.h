#pragma once

#include <string>
#include <vector>

namespace onramp {

/// Returns the user's language as an ISO 639 code of two or three lower-case letters, such as "ja".
[[nodiscard]] std::string localeLanguageCode();

/// Returns the user's country as an ISO 3166 code of two upper-case letters, such as "JP". The
/// result is empty when the country is unknown.
[[nodiscard]] std::string localeCountryCode();

/// Returns the user's languages, the most preferred one first, as identifiers such as "de", "zh_CN"
/// or "zh_Hans_CN".
[[nodiscard]] std::vector<std::string> preferredLanguages();

}  // namespace onramp
