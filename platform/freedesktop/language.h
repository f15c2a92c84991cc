#pragma once

#include <string>
#include <string_view>
#include <vector>

namespace onramp {

/// The parts of a language identifier, in any of its spellings: "zh_CN", "zh-Hans-CN",
/// "zh_CN.UTF-8" or, as on old media, "German".
struct Language {
  std::string code;    ///< ISO 639, small letters; empty when the identifier is malformed
  std::string script;  ///< ISO 15924, such as "Hans"; derived from the region for Chinese
  std::string region;  ///< ISO 3166, capitals; empty when not given

  [[nodiscard]] static Language parse(std::string_view identifier);
};

/// The `offered` languages in which to look for a resource, in that order, spelled as they were
/// offered. First come those that match the first `preferred` language that has a match: the exact
/// region, then the language without a region, then other regions of the language. Those that match
/// `development` follow. When nothing matches, English is searched, and when that is not offered
/// either, the first offered language in alphabetical order. A language in another script never
/// matches.
[[nodiscard]] std::vector<std::string> languagesToSearch(std::vector<std::string> offered,
                                                         const std::vector<std::string>& preferred,
                                                         const std::string& development);

}  // namespace onramp
