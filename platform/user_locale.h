#pragma once

#include <string>
#include <vector>

namespace onramp {

/// The user's language as a two- or three-letter ISO 639 code in small letters, such as "ja".
[[nodiscard]] std::string localeLanguageCode();

/// The user's country as a two-letter ISO 3166 code in capitals, such as "JP"; empty when unknown.
[[nodiscard]] std::string localeCountryCode();

/// The languages that the user reads, most preferred first, as identifiers such as "zh_CN" or "de".
[[nodiscard]] std::vector<std::string> preferredLanguages();

}  // namespace onramp
