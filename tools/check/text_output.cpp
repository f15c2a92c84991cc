#include <algorithm>
#include <cmath>
#include <iomanip>
#include <string>

#include "base/text.h"
#include "tools/check/output.h"
#include "tools/check/shown_texts.h"

namespace onramp::check {

namespace {

// Returns `text` with control characters replaced, so that it stays on one line and cannot control
// the terminal.
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
  if (!finding.effect.empty()) text += " Effect: " + finding.effect + ".";
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
  out << "\nModels (their devices have to announce exactly these names):\n";
  for (const ModelRow& model : report.models) {
    const std::string blanks(width - model.name.size(), ' ');
    out << "  " << printable(model.name) << blanks << "  " << cell(model.usb, "USB") << "  "
        << cell(model.wired, "wired") << "  " << cell(model.wireless, "wireless") << '\n';
  }
}

std::string counted(std::size_t count, const char* word) {
  return std::to_string(count) + ' ' + word + (count == 1 ? "" : "s");
}

const char* startInWords(FirstPage page) {
  switch (page) {
    case FirstPage::kNone:
      return "no page: the package opens at once, because no model supports wireless";
    case FirstPage::kConnectionType:
      return "the connection page: all models have the same connections by cable";
    case FirstPage::kModelList:
      break;
  }
  return "the model list";
}

}  // namespace

void writeText(std::ostream& out, const Report& report) {
  for (const Finding& finding : report.findings) {
    out << printable(placeOf(finding.place))
        << (finding.severity == Severity::kError ? "error: " : "warning: ")
        << printable(sentences(finding)) << " [" << finding.id << "]\n";
  }
  writeModels(out, report);
  out << "\nStarts with: " << startInWords(report.start)
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
      << report.medium << ": " << counted(report.count(Severity::kError), "error") << ", "
      << counted(report.count(Severity::kWarning), "warning") << ", "
      << counted(report.models.size(), "model") << '\n';
}

void writeTexts(std::ostream& out) {
  for (const ShownText& text : shownTexts()) {
    out << std::left << std::setw(44) << text.key << std::right << std::setw(4);
    if (text.width > 0) {
      out << std::lround(text.width) << " × " << text.lines;
    } else {
      out << '-' << "    ";
    }
    out << "  " << (text.mostPlaceholders > 0 ? "%@ once or twice, " : "") << text.where << '\n';
  }
}

}  // namespace onramp::check
