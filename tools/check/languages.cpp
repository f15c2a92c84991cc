#include "tools/check/languages.h"

#include <algorithm>
#include <array>
#include <filesystem>
#include <utility>

#include "base/ascii.h"
#include "media/medium.h"
#include "platform/bundle.h"
#include "platform/freedesktop/language.h"
#include "tools/check/shown_texts.h"

namespace onramp::check {

namespace {

namespace fs = std::filesystem;

constexpr const char* kNameTable = "InfoPlist.strings";

// Country codes that are easily taken for language codes, each with the code of the country's
// language. Only "kr" is also the code of a language, Kanuri.
constexpr std::array<std::pair<std::string_view, std::string_view>, 8> kCountries{{{"jp", "ja"},
                                                                                   {"cn", "zh"},
                                                                                   {"kr", "ko"},
                                                                                   {"cz", "cs"},
                                                                                   {"dk", "da"},
                                                                                   {"gr", "el"},
                                                                                   {"ua", "uk"},
                                                                                   {"vn", "vi"}}};

bool areLetters(std::string_view text) {
  return std::all_of(text.begin(), text.end(), isASCIILetter);
}

// Returns the parts of `name` between its hyphens and underscores.
std::vector<std::string_view> partsOf(std::string_view name) {
  std::vector<std::string_view> parts;
  for (std::size_t end = name.find_first_of("-_"); end != std::string_view::npos;
       end = name.find_first_of("-_")) {
    parts.push_back(name.substr(0, end));
    name.remove_prefix(end + 1);
  }
  parts.push_back(name);
  return parts;
}

// Returns whether `name` consists of a code of two or three letters, then perhaps a script of four
// letters, then perhaps a region of two letters or three digits, then perhaps variants such as
// "valencia" or "1996". Also returns true for a single longer word, because old media have English
// names, such as "German".
bool hasFormOfLanguage(std::string_view name) {
  const std::vector<std::string_view> parts = partsOf(name);
  const std::string_view code = parts.front();
  if (!areLetters(code) || code.size() < 2) return false;
  if (code.size() > 3) return parts.size() == 1;
  std::size_t next = 1;
  if (next < parts.size() && parts[next].size() == 4 && areLetters(parts[next])) ++next;
  if (next < parts.size()) {
    const std::string_view region = parts[next];
    const bool isNumber = std::all_of(region.begin(), region.end(), isASCIIDigit);
    if ((region.size() == 2 && areLetters(region)) || (region.size() == 3 && isNumber)) ++next;
  }
  const auto isVariant = [](std::string_view part) {
    return (part.size() >= 5 || (part.size() == 4 && isASCIIDigit(part[0]))) &&
           std::all_of(part.begin(), part.end(), isASCIILetterOrDigit);
  };
  while (next < parts.size() && isVariant(parts[next]))
    ++next;
  return next == parts.size();
}

// Returns the code of the language `name`, but "nb" instead of "no": both mean Norwegian Bokmål.
std::string codeOf(const std::string& name) {
  const std::string code = Language::parse(name).code;
  return code == "no" ? "nb" : code;
}

// Returns whether `offered` contains the language `wanted`, in any region. Another script or a
// related language does not count, even if the system would use it instead.
bool serves(const std::vector<std::string>& offered, const std::string& wanted) {
  const std::vector<std::string> found = languagesToSearch(offered, {wanted}, "");
  if (found.empty() || !isSameLanguage(found.front(), wanted)) return false;
  const std::string first = Language::parse(found.front()).script;
  const std::string second = Language::parse(wanted).script;
  return first.empty() || second.empty() || first == second;
}

// Returns how many of the texts that the wizard shows are the same in two tables.
std::size_t commonTexts(const Dictionary& a, const Dictionary& b) {
  return static_cast<std::size_t>(
      std::count_if(shownTexts().begin(), shownTexts().end(), [&](const ShownText& shown) {
        const auto text = a.string(shown.key);
        return text && text == b.string(shown.key);
      }));
}

class LanguageCheck {
 public:
  LanguageCheck(const MediumFiles& files, const Lists& lists,
                const std::map<std::string, Dictionary>& tables)
      : files_(files),
        lists_(lists),
        report_(files.report()),
        tables_(tables),
        languages_(languagesIn(files, std::string(kMessageBundle) + "/Contents/Resources")) {}

  void run() {
    checkFolderNames(std::string(kMessageBundle) + "/Contents/Resources", "Localizable.strings");
    checkTranslations();
    checkDevelopmentRegion();
    checkApplicationLanguages();
    checkToolLanguages();
  }

 private:
  // Reports each language in which at least half of the wizard's texts are the same as in English.
  // A new language usually begins as a copy of the English table, and some texts may be left
  // untranslated by mistake.
  void checkTranslations() {
    const auto english = std::find_if(tables_.begin(), tables_.end(), [](const auto& table) {
      return isSameLanguage(table.first, "en");
    });
    if (english == tables_.end()) return;
    for (const auto& [language, texts] : tables_) {
      const std::size_t same = commonTexts(texts, english->second);
      if (isSameLanguage(language, "en") || 2 * same < shownTexts().size()) continue;
      report_.findings.push_back(
          {.id = "texts-copied",
           .severity = Severity::kWarning,
           .place = {.file = messageTable(language)},
           .found = std::to_string(same) + " texts that are the same in " + quoted(english->first),
           .expected = "texts in the language " + quoted(language),
           .effect = "users of " + quoted(language) + " see text in the wrong language",
           .remedy = "translate these texts"});
    }
  }

  // Reports each folder in `resources` that has `table`, but whose name does not end in ".lproj".
  void checkFolderNames(const std::string& resources, const std::string& table) {
    for (const std::string& name : files_.names(resources)) {
      const std::string folder = (fs::path(resources) / name).string();
      const std::vector<std::string> contents = files_.names(folder);
      if (name.ends_with(kLanguageFolder) ||
          !std::binary_search(contents.begin(), contents.end(), table))
        continue;
      const std::string language = fs::path(name).stem().string();
      report_.findings.push_back(
          {.id = "language-folder",
           .severity = Severity::kWarning,
           .place = {.file = folder},
           .found = "a folder with " + quoted(table) + " whose name does not end in \".lproj\"",
           .expected = "a name such as \"de.lproj\"",
           .nearest = isLanguage(language) ? language + std::string(kLanguageFolder) : "",
           .effect = "nobody sees its texts",
           .remedy = "rename the folder, or remove it if it is only a copy"});
    }
  }

  void checkDevelopmentRegion() {
    constexpr const char* kKey = "CFBundleDevelopmentRegion";
    const std::string path = std::string(kMessageBundle) + "/Contents/Info.plist";
    const std::string effect = serves(languages_, "en")
                                   ? "users without texts in their language see another language "
                                     "that their system picks, usually English"
                                   : "users without texts in their language may see keys such as "
                                     "\"INST_TXT_MODEL\" instead of text";
    const auto information =
        files_.list(path, {{.file = path}, "the message bundle's Info.plist", effect});
    if (!information) return;
    const auto region = information->string(kKey);
    const std::string offered =
        languages_.empty() ? "the languages that you add to the bundle" : joined(languages_);
    Finding finding{.id = "region-missing",
                    .place = {.file = path},
                    .found = "no \"CFBundleDevelopmentRegion\"",
                    .expected = "the language for users without texts in their own, such as \"en\"",
                    .effect = effect,
                    .remedy = "add \"CFBundleDevelopmentRegion\" with one of " + offered};
    if (region) {
      if (serves(languages_, *region)) return;
      finding.id = "region-without-texts";
      finding.place.key = {kKey};
      finding.found = "the language " + quoted(*region) + ", which the bundle does not have";
      finding.expected = "one of " + offered;
      finding.remedy =
          "name one of the expected languages, or add the " + quoted(*region) + " texts";
    } else if (information->find(kKey)) {
      finding.place.key = {kKey};
      finding.found = "a value that is not a string";
      finding.remedy = "write one of " + offered;
    }
    report_.findings.push_back(std::move(finding));
  }

  // Reports each language that the message bundle has and the application lacks. The message bundle
  // cannot supply the application's texts.
  void checkApplicationLanguages() {
    if (!lists_.information) return;
    const std::string resources = report_.application + "/Contents/Resources";
    checkFolderNames(resources, kNameTable);
    const std::vector<std::string> own = languagesIn(files_, resources, kNameTable);
    for (const std::string& language : languagesBeyond(own)) {
      reportMissingLanguage(
          "language-not-in-application", resources, language, own,
          "read and hear some of the application's texts in English: why the wizard uses the "
          "network, and the name of the gear button",
          "have the application built with text in that language");
    }
  }

  // Reports each language that the message bundle has and the set-up tool lacks. A tool without
  // translations has the same name for all users, so nothing is missing.
  void checkToolLanguages() {
    const auto tool = lists_.resources ? lists_.resources->string(medium::kWLANtool) : std::nullopt;
    const auto bundle = tool ? Bundle::open(files_.fullPath(*tool)) : std::nullopt;
    if (!bundle) return;
    const std::string resources = *tool + "/Contents/Resources";
    checkFolderNames(resources, kNameTable);
    const std::string region = bundle->infoString("CFBundleDevelopmentRegion").value_or("en");
    const std::vector<std::string> own = languagesIn(files_, resources, kNameTable);
    const bool isTranslated = std::any_of(own.begin(), own.end(), [&](const std::string& language) {
      return !isSameLanguage(language, region);
    });
    if (!isTranslated) return;
    std::vector<std::string> served = own;
    served.push_back(region);
    for (const std::string& language : languagesBeyond(served)) {
      reportMissingLanguage("language-not-in-tool", resources, language, own,
                            "see the set-up tool's name in another language",
                            "add the tool's name in that language, in its InfoPlist.strings");
    }
  }

  // Returns the languages of the message bundle that `served` lacks.
  [[nodiscard]] std::vector<std::string> languagesBeyond(
      const std::vector<std::string>& served) const {
    std::vector<std::string> languages;
    for (const std::string& language : languages_) {
      if (isLanguage(language) && !serves(served, language)) languages.push_back(language);
    }
    return languages;
  }

  void reportMissingLanguage(const char* id, const std::string& resources,
                             const std::string& language, const std::vector<std::string>& own,
                             const std::string& effect, const char* remedy) {
    const std::string folder = language + std::string(kLanguageFolder);
    const std::vector<std::string> all = files_.names(resources);
    const bool isThere = std::binary_search(all.begin(), all.end(), folder);
    report_.findings.push_back({.id = id,
                                .severity = Severity::kWarning,
                                .place = {.file = resources},
                                .found = isThere
                                             ? "no " + quoted(kNameTable) + " in " + quoted(folder)
                                             : "no " + quoted(folder),
                                .expected = "the languages of the message bundle; here are " +
                                            (own.empty() ? "none" : joined(own)),
                                .effect = "users of " + quoted(language) + " " + effect,
                                .remedy = remedy});
  }

  const MediumFiles& files_;
  const Lists& lists_;
  Report& report_;
  const std::map<std::string, Dictionary>& tables_;
  std::vector<std::string> languages_;
};

}  // namespace

std::string messageTable(const std::string& language) {
  return std::string(kMessageBundle) + "/Contents/Resources/" + language +
         std::string(kLanguageFolder) + "/Localizable.strings";
}

std::vector<std::string> languagesIn(const MediumFiles& files, const std::string& resources,
                                     const std::string& table) {
  std::vector<std::string> languages;
  for (const std::string& name : files.names(resources)) {
    // macOS writes files whose names begin with "._" to file systems without extended attributes.
    if (!name.ends_with(kLanguageFolder) || name.starts_with('.') || name == "Base.lproj") continue;
    const std::vector<std::string> contents = files.names((fs::path(resources) / name).string());
    if (table.empty() || std::binary_search(contents.begin(), contents.end(), table))
      languages.push_back(name.substr(0, name.size() - kLanguageFolder.size()));
  }
  return languages;
}

bool isLanguage(const std::string& name) {
  return hasFormOfLanguage(name) && !Language::parse(name).code.empty() && !languageOfCountry(name);
}

std::optional<std::string> languageOfCountry(const std::string& name) {
  const std::string code = Language::parse(name).code;
  const auto found = std::find_if(kCountries.begin(), kCountries.end(),
                                  [&](const auto& pair) { return pair.first == code; });
  return found == kCountries.end() ? std::nullopt : std::optional(std::string(found->second));
}

bool isSameLanguage(const std::string& a, const std::string& b) {
  return codeOf(a) == codeOf(b);
}

void checkLanguages(const MediumFiles& files, const Lists& lists,
                    const std::map<std::string, Dictionary>& tables) {
  LanguageCheck(files, lists, tables).run();
}

}  // namespace onramp::check
