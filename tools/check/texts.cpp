#include <algorithm>
#include <cmath>
#include <map>
#include <optional>
#include <set>

#include "tools/check/checks.h"
#include "tools/check/languages.h"
#include "tools/check/shown_texts.h"
#include "tools/check/spelling.h"

namespace onramp::check {

namespace {

std::size_t placeholders(const std::string& text) {
  std::size_t count = 0;
  for (std::size_t at = text.find("%@"); at != std::string::npos; at = text.find("%@", at + 2))
    ++count;
  return count;
}

class TextCheck {
 public:
  TextCheck(const MediumFiles& files, const Lists& lists)
      : files_(files), lists_(lists), report_(files.report()) {}

  void run() {
    constexpr const char* kEffect = "keys such as \"INST_TXT_MODEL\" instead of text";
    const std::string bundle(kMessageBundle);
    if (!files_.exists(bundle, {{.file = bundle}, "the message bundle", kEffect})) return;
    for (const std::string& language : languagesIn(files_, bundle + "/Contents/Resources"))
      read(language, kEffect);
    for (const auto& [language, table] : tables_)
      check(language, table);
    checkLanguages(files_, lists_, tables_);
  }

 private:
  void read(const std::string& language, const std::string& effect) {
    const std::string path = messageTable(language);
    if (!isLanguage(language)) {
      const auto meant = languageOfCountry(language);
      report_.findings.push_back(
          {.id = "language-unknown",
           .severity = Severity::kWarning,
           .place = {.file = std::string(kMessageBundle) + "/Contents/Resources/" + language +
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
                    .place = {.file = messageTable(language), .key = {key}},
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
         .place = {.file = messageTable(language)},
         .found = "no " + quoted(key),
         .expected = others.empty() ? "a text" : "a text, as in " + joined(others),
         .effect = effectOf(language, key),
         .remedy = "add the line " + quoted(key) + " = \"…\";"});
  }

  void checkText(const std::string& language, const ShownText& shown, const std::string& text) {
    Finding finding{.place = {.file = messageTable(language), .key = {std::string(shown.key)}},
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

  const MediumFiles& files_;
  const Lists& lists_;
  Report& report_;
  std::map<std::string, Dictionary> tables_;
};

}  // namespace

void checkTexts(const MediumFiles& files, const Lists& lists) {
  TextCheck(files, lists).run();
}

}  // namespace onramp::check
