#pragma once

#include <string>
#include <string_view>
#include <vector>

namespace onramp {

/// The parts of a language identifier, in any of its spellings: "zh_CN", "zh-Hans-CN",
/// "zh_CN.UTF-8" or, as on old media, "German".
struct Language {
  std::string code;  ///< ISO 639, in lower case; empty when the identifier is malformed
  /// ISO 15924, such as "Hans"; empty when not given. Chinese without a script gets the script that
  /// is usual in its region.
  std::string script;
  std::string region;  ///< ISO 3166, in upper case; empty when not given

  /// Splits `identifier` into its parts.
  [[nodiscard]] static Language parse(std::string_view identifier);
};

/// Returns the languages in which to look for a resource, in the order of the search and spelled as
/// in `offered`. The result begins with the matches of the first language in `preferred` that has a
/// match. Of these, the match with the exact region comes first, then a match without a region,
/// then matches with other regions. The matches of `development` follow. If nothing matches, the
/// result is English. If English is not offered, the result is the offered language that comes
/// first in alphabetical order. The result is empty when no well-formed language is offered. Two
/// languages whose scripts are known and differ never match.
[[nodiscard]] std::vector<std::string> languagesToSearch(std::vector<std::string> offered,
                                                         const std::vector<std::string>& preferred,
                                                         const std::string& development);

}  // namespace onramp
