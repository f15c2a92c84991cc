#pragma once

#include <string>
#include <vector>

namespace onramp {

/// The user's language as an ISO 639 code of two or three lower-case letters, such as "ja".
[[nodiscard]] std::string localeLanguageCode();

/// The user's country as an ISO 3166 code of two upper-case letters, such as "JP"; empty when
/// unknown.
[[nodiscard]] std::string localeCountryCode();

/// The user's languages, most preferred first, as identifiers such as "zh_CN" or "de".
[[nodiscard]] std::vector<std::string> preferredLanguages();

}  // namespace onramp
