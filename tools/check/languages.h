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

/// Returns whether `name` is well formed as the name of a language, such as "de", "zh_TW",
/// "zh-Hans-CN" or "German", and is not the code of a country that is easily taken for a language.
[[nodiscard]] bool isLanguage(const std::string& name);

/// Returns the code of the language that the author of the folder `name` probably meant. Returns
/// nothing when `name` is not the code of a country that is easily taken for a language.
[[nodiscard]] std::optional<std::string> languageOfCountry(const std::string& name);

/// Returns whether two names are those of the same language, in any region and script.
[[nodiscard]] bool isSameLanguage(const std::string& a, const std::string& b);

/// Checks that the languages of the message bundle are translated and complete: the bundle must
/// have the language that users of all other languages see, and the application and the set-up
/// tool must have the bundle's languages. `tables` maps each language to its strings.
void checkLanguages(const MediumFiles& files, const Lists& lists,
                    const std::map<std::string, Dictionary>& tables);

}  // namespace onramp::check
