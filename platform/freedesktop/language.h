#pragma once

#include <string>
#include <string_view>
#include <vector>

namespace onramp {

/// What a language identifier says, whether it is written "zh_CN", "zh-Hans-CN", "zh_CN.UTF-8" or,
/// as on old media, "German".
struct Language {
  std::string code;    ///< ISO 639, small letters; empty when the identifier is malformed
  std::string script;  ///< ISO 15924, such as "Hans"; told from the region for Chinese
  std::string region;  ///< ISO 3166, capitals; empty when not given

  [[nodiscard]] static Language parse(std::string_view identifier);
};

/// Which of the `offered` languages to look for a resource in, and in which order: those of the
/// first of the `preferred` ones that has any, the exact region first, then the language without a
/// region, then the same language of another region; after them those of the `development`
/// language. A script is never exchanged for another one. Texts come back as they were offered.
[[nodiscard]] std::vector<std::string> languagesToSearch(std::vector<std::string> offered,
                                                         const std::vector<std::string>& preferred,
                                                         const std::string& development);

}  // namespace onramp
