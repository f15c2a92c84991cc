#include <algorithm>
#include <string>

#include "base/text.h"
#include "tools/check/output.h"

namespace onramp::check {

namespace {

// A name on one line, with what a terminal would obey made visible.
std::string printable(std::string_view text) {
  std::string result;
  while (!text.empty()) {
    const char32_t character = takeUTF8(text).value_or(kReplacementCharacter);
    const bool control = character < 0x20 || (character >= 0x7F && character < 0xA0);
    appendUTF8(result, control ? kReplacementCharacter : character);
  }
  return result;
}

std::string placeOf(const Place& place) {
  std::string text = place.file;
  if (place.line) text += ":" + std::to_string(*place.line);
  text += ": ";
  if (place.byte) text += "byte " + std::to_string(*place.byte) + ": ";
  std::string key;
  for (const std::string& part : place.key)
    key += (key.empty() ? "" : "/") + part;
  return key.empty() ? text : text + key + ": ";
}

std::string sentences(const Finding& finding) {
  std::string text = finding.found;
  if (!finding.expected.empty()) text += "; expected: " + finding.expected;
  if (!finding.nearest.empty()) text += "; did you mean " + quoted(finding.nearest) + "?";
  if (finding.nearest.empty()) text += ".";
  if (!finding.effect.empty()) text += " Users get: " + finding.effect + ".";
  if (!finding.remedy.empty()) text += " Remedy: " + finding.remedy + ".";
  return text;
}

void writeModels(std::ostream& out, const Report& report) {
  if (report.models.empty()) return;
  std::size_t width = 0;
  for (const ModelRow& model : report.models)
    width = std::max(width, model.name.size());
  const auto cell = [](bool has, const char* word) {
    return has ? std::string(word) : std::string(std::string_view(word).size(), '-');
  };
  out << "\nModels:\n";
  for (const ModelRow& model : report.models) {
    const std::string blanks(width - model.name.size(), ' ');
    out << "  " << printable(model.name) << blanks << "  " << cell(model.usb, "USB") << "  "
        << cell(model.wired, "wired") << "  " << cell(model.wireless, "wireless") << '\n';
  }
}

}  // namespace

void writeText(std::ostream& out, const Report& report) {
  for (const Finding& finding : report.findings) {
    out << printable(placeOf(finding.place))
        << (finding.severity == Severity::kError ? "error: " : "warning: ")
        << printable(sentences(finding)) << " [" << finding.id << "]\n";
  }
  writeModels(out, report);
  out << "\nStarts with: " << report.start
      << "\nSystems: " << (report.systems.empty() ? "unknown" : report.systems) << '\n';
  for (const PackageRow& row : report.packages) {
    out << "  " << row.systems << ": "
        << (row.package.empty() ? "no package" : printable(row.package)) << '\n';
  }
  out << "Languages:";
  for (const LanguageRow& language : report.languages)
    out << ' ' << printable(language.name) << " (" << language.texts << " texts)";
  out << (report.languages.empty() ? " none\n" : "\n");
  out << '\n'
      << report.medium << ": " << report.count(Severity::kError) << " errors, "
      << report.count(Severity::kWarning) << " warnings, " << report.models.size() << " models\n";
}

}  // namespace onramp::check
