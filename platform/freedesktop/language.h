#pragma once

#include <string>
#include <string_view>
#include <vector>

namespace onramp {

/// The parts of a language identifier such as "zh_CN", "zh-Hans-CN", "zh_CN.UTF-8" or, on old
/// media, "German".
struct Language {
  std::string code;  ///< ISO 639, in lower case; empty when the identifier is malformed
  /// ISO 15924, such as "Hans"; empty when not given. For Chinese without a script, this is "Hant"
  /// if the region is TW, HK or MO, and "Hans" otherwise.
  std::string script;
  std::string region;  ///< ISO 3166, in upper case; empty when not given

  /// Splits `identifier` into its parts.
  [[nodiscard]] static Language parse(std::string_view identifier);
};

/// Returns the languages in which to look for a resource, spelled as in `offered`. The languages
/// come in this order:
/// - the matches for the first language in `preferred` that has a match: first the matches with the
///   same region, then those without a region, then those with other regions;
/// - the matches for `development`;
/// - if there is no match so far, the matches for English;
/// - if there is still no match, the alphabetically first well-formed language in `offered`.
/// Two languages whose scripts are known and differ never match. The result is empty when `offered`
/// has no well-formed language.
[[nodiscard]] std::vector<std::string> languagesToSearch(std::vector<std::string> offered,
                                                         const std::vector<std::string>& preferred,
                                                         const std::string& development);

}  // namespace onramp
