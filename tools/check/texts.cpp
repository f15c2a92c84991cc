#include <algorithm>
#include <array>
#include <cmath>
#include <filesystem>
#include <map>
#include <optional>
#include <set>
#include <system_error>
#include <utility>

#include "media/medium.h"
#include "platform/bundle.h"
#include "platform/freedesktop/language.h"
#include "tools/check/checks.h"
#include "tools/check/shown_texts.h"
#include "tools/check/spelling.h"

namespace onramp::check {

namespace {

constexpr std::string_view kLanguageFolder = ".lproj";

// Country codes that are easily mistaken for the code of the country's language. None of them is a
// language code.
constexpr std::array<std::pair<std::string_view, std::string_view>, 8> kCountries{{{"jp", "ja"},
                                                                                   {"cn", "zh"},
                                                                                   {"kr", "ko"},
                                                                                   {"cz", "cs"},
                                                                                   {"dk", "da"},
                                                                                   {"gr", "el"},
                                                                                   {"ua", "uk"},
                                                                                   {"vn", "vi"}}};

// Returns the code of the language that the folder's author probably meant. Returns nothing when
// `code` is not a country code.
std::optional<std::string> languageOfCountry(std::string_view code) {
  const auto found = std::find_if(kCountries.begin(), kCountries.end(),
                                  [&](const auto& pair) { return pair.first == code; });
  return found == kCountries.end() ? std::nullopt : std::optional(std::string(found->second));
}
const std::string kBundle = "MacResources/CDCommonMessage.bundle";

std::vector<std::string> languagesIn(const MediumFiles& files, const std::string& resources) {
  std::vector<std::string> languages;
  for (const std::string& name : files.names(resources)) {
    if (!name.ends_with(kLanguageFolder) || name == "Base.lproj") continue;
    languages.push_back(name.substr(0, name.size() - kLanguageFolder.size()));
  }
  return languages;
}

bool isLanguage(const std::string& name) {
  const std::string code = Language::parse(name).code;
  return !code.empty() && !languageOfCountry(code);
}

std::size_t placeholders(const std::string& text) {
  std::size_t count = 0;
  for (std::size_t at = text.find("%@"); at != std::string::npos; at = text.find("%@", at + 2))
    ++count;
  return count;
}

std::string joined(const std::vector<std::string>& words) {
  std::string text;
  for (const std::string& word : words)
    text += (text.empty() ? "" : ", ") + word;
  return text;
}

// Returns whether `offered` contains the language `wanted`, in any region. A related language does
// not count, even if the system would use it instead.
bool serves(const std::vector<std::string>& offered, const std::string& wanted) {
  const std::vector<std::string> found = languagesToSearch(offered, {wanted}, "");
  if (found.empty()) return false;
  const Language first = Language::parse(found.front());
  const Language language = Language::parse(wanted);
  return first.code == language.code &&
         (first.script.empty() || language.script.empty() || first.script == language.script);
}

class TextCheck {
 public:
  TextCheck(const MediumFiles& files, const Lists& lists)
      : files_(files), lists_(lists), report_(files.report()) {}

  void run() {
    constexpr const char* kEffect = "keys such as \"INST_TXT_MODEL\" instead of text";
    if (!files_.exists(kBundle, {{.file = kBundle}, "the message bundle", kEffect})) return;
    languages_ = languagesIn(files_, kBundle + "/Contents/Resources");
    for (const std::string& language : languages_)
      read(language, kEffect);
    for (const auto& [language, table] : tables_)
      check(language, table);
    checkTranslations();
    checkDevelopmentRegion();
    checkApplicationLanguages();
    checkToolLanguages();
  }

 private:
  static std::string tablePath(const std::string& language) {
    return kBundle + "/Contents/Resources/" + language + std::string(kLanguageFolder) +
           "/Localizable.strings";
  }

  void read(const std::string& language, const std::string& effect) {
    const std::string path = tablePath(language);
    if (!isLanguage(language)) {
      const auto meant = languageOfCountry(Language::parse(language).code);
      report_.findings.push_back({.id = "language-unknown",
                                  .severity = Severity::kWarning,
                                  .place = {.file = kBundle + "/Contents/Resources/" + language +
                                                    std::string(kLanguageFolder)},
                                  .found = "a folder whose name is not a language",
                                  .expected = "a code such as \"de\" or \"zh_TW\"",
                                  .nearest = meant ? *meant + std::string(kLanguageFolder) : "",
                                  .effect = "nobody sees its texts",
                                  .remedy = "rename the folder"});
      return;
    }
    const auto table = files_.strings(path, {{.file = path},
                                             "the " + quoted(language) + " texts",
                                             "users of " + quoted(language) + " see " + effect});
    if (table) tables_.emplace(language, *table);
  }

  void check(const std::string& language, const Dictionary& table) {
    std::vector<std::string> absent;
    LanguageRow row{.name = language};
    for (const ShownText& shown : shownTexts()) {
      const Value* const value = table.find(shown.key);
      const auto text = table.string(shown.key);
      if (!value) absent.emplace_back(shown.key);
      if (!text) continue;
      ++row.texts;
      checkText(language, shown, *text);
    }
    report_.languages.push_back(row);
    Spelling spelling(absent);
    std::set<std::string> meant;
    for (const Dictionary::Pair& pair : table) {
      const bool known = std::any_of(shownTexts().begin(), shownTexts().end(),
                                     [&](const ShownText& shown) { return shown.key == pair.key; });
      if (!known) unknown(language, pair.key, spelling.nearest(pair.key), meant);
    }
    for (const std::string& key : absent) {
      if (!meant.contains(key)) missing(language, key);
    }
  }

  [[nodiscard]] static std::string effectOf(const std::string& language, std::string_view key) {
    const auto shown = std::find_if(shownTexts().begin(), shownTexts().end(),
                                    [&](const ShownText& text) { return text.key == key; });
    return "users of " + quoted(language) + " see " +
           (shown->hasFallback ? std::string("an English text") : quoted(std::string(key))) + " (" +
           std::string(shown->where) + ")";
  }

  void unknown(const std::string& language, const std::string& key,
               const std::optional<std::string>& nearest, std::set<std::string>& meant) {
    Finding finding{.id = "text-unknown",
                    .severity = Severity::kWarning,
                    .place = {.file = tablePath(language), .key = {key}},
                    .found = "a text that the wizard does not show",
                    .effect = "none, because the wizard ignores the text",
                    .remedy = "remove the text"};
    if (nearest && meant.insert(*nearest).second) {
      finding.id = "text-misspelt";
      finding.severity = Severity::kError;
      finding.found = "an unknown key";
      finding.nearest = *nearest;
      finding.effect = effectOf(language, *nearest);
      finding.remedy = "rename the key to " + quoted(*nearest);
    }
    report_.findings.push_back(std::move(finding));
  }

  void missing(const std::string& language, const std::string& key) {
    std::vector<std::string> others;
    for (const auto& [other, table] : tables_) {
      if (table.find(key)) others.push_back(other);
    }
    report_.findings.push_back(
        {.id = "text-missing",
         .place = {.file = tablePath(language)},
         .found = "no " + quoted(key),
         .expected = others.empty() ? "a text" : "a text, as in " + joined(others),
         .effect = effectOf(language, key),
         .remedy = "add the line " + quoted(key) + " = \"…\";"});
  }

  void checkText(const std::string& language, const ShownText& shown, const std::string& text) {
    Finding finding{.place = {.file = tablePath(language), .key = {std::string(shown.key)}},
                    .effect = effectOf(language, shown.key)};
    const std::size_t count = placeholders(text);
    const bool filled = shown.mostPlaceholders > 0;
    const bool wrongCount = filled ? count < 1 || count > shown.mostPlaceholders : count > 0;
    if (text.find_first_not_of(" \t\r\n") == std::string::npos) {
      finding.id = "text-empty";
      finding.found = "an empty text";
      finding.effect = "nothing where a text belongs (" + std::string(shown.where) + ")";
      finding.remedy = "write the text";
    } else if (wrongCount) {
      finding.id = "text-placeholders";
      finding.found = count == 0   ? "no \"%@\""
                      : count == 1 ? "one \"%@\""
                                   : "\"%@\" " + std::to_string(count) + " times";
      finding.expected = filled ? "\"%@\" once or twice" : "no \"%@\"";
      finding.effect = filled && count == 0 ? "an alert that does not say which version is needed"
                                            : "a literal \"%@\" (" + std::string(shown.where) + ")";
      finding.remedy = filled ? "write \"%@\" exactly where a version belongs" : "remove \"%@\"";
    } else if (shown.where == "sheet when no device is found" &&
               text.find('%') != std::string::npos) {
      finding.id = "text-percent";
      finding.found = "a \"%\", which macOS treats as the beginning of a placeholder";
      finding.expected = "a text without \"%\"";
      finding.effect = "a damaged text, or a crash, on macOS";
      finding.remedy = "write a word instead";
    } else {
      tooWide(shown, text, finding);
    }
    if (!finding.id.empty()) report_.findings.push_back(std::move(finding));
  }

  static void tooWide(const ShownText& shown, const std::string& text, Finding& finding) {
    if (shown.width == 0 || estimatedLines(text, shown.size, shown.width) <= shown.lines) return;
    finding.id = "text-wide";
    finding.severity = Severity::kWarning;
    finding.found = "a text that is about " +
                    std::to_string(std::lround(estimatedWidth(text, shown.size))) +
                    " points wide, by an estimate without fonts";
    const std::string width = std::to_string(std::lround(shown.width)) + " points";
    finding.expected = shown.lines == 1
                           ? "at most " + width
                           : "at most " + std::to_string(shown.lines) + " lines of " + width;
    finding.effect = "a text that is probably cut off (" + std::string(shown.where) + ")";
    finding.remedy = "shorten the text, or see in the wizard whether it fits";
  }

  // Reports each language that has at least half of its texts in common with English or with an
  // earlier language. A new language usually begins as a copy, and some texts may be left so by
  // mistake.
  void checkTranslations() {
    for (const auto& [language, texts] : tables_) {
      for (const auto& [other, originals] : tables_) {
        const std::string code = Language::parse(language).code;
        const std::string otherCode = Language::parse(other).code;
        const bool isFirst = otherCode == "en" || (code != "en" && other < language);
        const std::size_t same = code == otherCode || !isFirst ? 0 : commonTexts(texts, originals);
        if (same == 0 || same < texts.size() / 2) continue;
        report_.findings.push_back(
            {.id = "texts-copied",
             .severity = Severity::kWarning,
             .place = {.file = tablePath(language)},
             .found = std::to_string(same) + " texts that are the same in " + quoted(other),
             .expected = "texts in the language " + quoted(language),
             .effect = "users of " + quoted(language) + " see text in the wrong language",
             .remedy = "translate these texts"});
        break;
      }
    }
  }

  static std::size_t commonTexts(const Dictionary& texts, const Dictionary& others) {
    return static_cast<std::size_t>(
        std::count_if(texts.begin(), texts.end(), [&](const Dictionary::Pair& pair) {
          const Value* const other = others.find(pair.key);
          return other && *other == pair.value;
        }));
  }

  void checkDevelopmentRegion() {
    constexpr const char* kKey = "CFBundleDevelopmentRegion";
    const std::string path = kBundle + "/Contents/Info.plist";
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
    std::vector<std::string> own = languagesIn(files_, resources);
    std::erase_if(own, [&](const std::string& language) {
      const auto names = files_.names(resources + "/" + language + std::string(kLanguageFolder));
      return !std::binary_search(names.begin(), names.end(), "InfoPlist.strings");
    });
    for (const std::string& language : languagesBeyond(own)) {
      reportMissingLanguage(
          "language-not-in-application", resources, language, own,
          "read and hear some of the application's texts in English: why the wizard uses the "
          "network, and the name of the gear button",
          "have the application built with text in that language");
    }
  }

  // Reports each language that the message bundle has and the set-up tool lacks. A tool without any
  // language has the same name for all users, so nothing is missing.
  void checkToolLanguages() {
    const auto tool = lists_.resources ? lists_.resources->string(medium::kWLANtool) : std::nullopt;
    const auto bundle = tool ? Bundle::open(files_.fullPath(*tool)) : std::nullopt;
    if (!bundle) return;
    const std::string resources = *tool + "/Contents/Resources";
    const std::vector<std::string> own = languagesIn(files_, resources);
    if (own.empty()) return;
    std::vector<std::string> served = own;
    served.push_back(bundle->infoString("CFBundleDevelopmentRegion").value_or("en"));
    for (const std::string& language : languagesBeyond(served)) {
      reportMissingLanguage("language-not-in-tool", resources, language, own,
                            "see the set-up tool's name in another language",
                            "add the folder, with the tool's name in its InfoPlist.strings");
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
    report_.findings.push_back({.id = id,
                                .severity = Severity::kWarning,
                                .place = {.file = resources},
                                .found = "no " + quoted(language + std::string(kLanguageFolder)),
                                .expected = "the languages of the message bundle; here are " +
                                            (own.empty() ? "none" : joined(own)),
                                .effect = "users of " + quoted(language) + " " + effect,
                                .remedy = remedy});
  }

  const MediumFiles& files_;
  const Lists& lists_;
  Report& report_;
  std::vector<std::string> languages_;
  std::map<std::string, Dictionary> tables_;
};

}  // namespace

void checkTexts(const MediumFiles& files, const Lists& lists) {
  TextCheck(files, lists).run();
}

}  // namespace onramp::check
