#pragma once

#include <map>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "base/value.h"
#include "tools/check/lists.h"
#include "tools/check/medium_files.h"

namespace onramp::check {

/// The message bundle, relative to the medium.
inline constexpr std::string_view kMessageBundle = "MacResources/CDCommonMessage.bundle";

/// The end of the name of a folder that holds the strings of one language.
inline constexpr std::string_view kLanguageFolder = ".lproj";

/// Returns the path of the strings table of `language` in the message bundle, relative to the
/// medium.
[[nodiscard]] std::string messageTable(const std::string& language);

/// Returns the names of the languages that have a folder in the folder `resources`, which is
/// relative to the medium. If `table` is given, leaves out the languages whose folder has no file
/// of this name.
[[nodiscard]] std::vector<std::string> languagesIn(const MediumFiles& files,
                                                   const std::string& resources,
                                                   const std::string& table = "");

/// Returns whether `name` has the form of a language code, such as "de", "zh_TW" or "zh-Hans-CN",
/// or is an English name that old media use, such as "German". Returns false if `name` begins with
/// a country code that is easily taken for a language code, such as "jp".
[[nodiscard]] bool isLanguage(const std::string& name);

/// If `name` begins with a country code that is easily taken for a language code, returns the code
/// of the country's language, such as "ja" for "jp". Otherwise returns nothing.
[[nodiscard]] std::optional<std::string> languageOfCountry(const std::string& name);

/// Returns whether two names stand for the same language, whatever their regions and scripts.
[[nodiscard]] bool isSameLanguage(const std::string& a, const std::string& b);

/// Checks that the message bundle's texts are translated, that the bundle has its fallback
/// language, which users see if it has none of their own languages, and that the application and
/// the set-up tool have all of the bundle's languages. `tables` maps each language of the bundle to
/// its strings.
void checkLanguages(const MediumFiles& files, const Lists& lists,
                    const std::map<std::string, Dictionary>& tables);

}  // namespace onramp::check
