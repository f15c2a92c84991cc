#include <algorithm>
#include <cmath>
#include <iomanip>
#include <string>

#include "base/text.h"
#include "tools/check/lists.h"
#include "tools/check/output.h"
#include "tools/check/shown_texts.h"
#include "tools/terminal_text.h"

namespace onramp::check {

namespace {

constexpr std::string_view kRed = "\033[31m";
constexpr std::string_view kYellow = "\033[33m";
constexpr std::string_view kPlain = "\033[0m";
// The width of a model's line without the name, in columns of the terminal.
constexpr std::size_t kConnectionColumns = 24;

// Returns `text` with replacement characters for its control characters and damaged bytes, so that
// the text stays on one line and cannot control the terminal.
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

void writeFinding(std::ostream& out, const Finding& finding, std::size_t width) {
  const bool isError = finding.severity == Severity::kError;
  const std::string mark = isError ? "error:" : "warning:";
  const std::string text = printable(sentences(finding)) + " [" + finding.id + "]";
  out << printable(placeOf(finding.place));
  if (width == 0) {
    out << mark << ' ' << text << '\n';
  } else {
    out << (isError ? kRed : kYellow) << mark << kPlain << '\n' << wrapped(text, width, 2);
  }
}

void writeModels(std::ostream& out, const Report& report, std::size_t terminal) {
  if (report.models.empty()) return;
  std::size_t width = 0;
  for (const ModelRow& model : report.models)
    width = std::max(width, columnsOf(printable(model.name)));
  if (terminal > kConnectionColumns) width = std::min(width, terminal - kConnectionColumns);
  const auto cell = [](bool has, const char* word) {
    return has ? std::string(word) : std::string(std::string_view(word).size(), '-');
  };
  out << "\nModels (their devices must announce exactly these names):\n";
  for (const ModelRow& model : report.models) {
    out << "  " << fitted(printable(model.name), width) << "  " << cell(model.usb, "USB") << "  "
        << cell(model.wired, "wired") << "  " << cell(model.wireless, "wireless") << '\n';
  }
}

std::string counted(std::size_t count, const char* word) {
  return std::to_string(count) + ' ' + word + (count == 1 ? "" : "s");
}

const char* startInWords(FirstPage page) {
  switch (page) {
    case FirstPage::kNone:
      return "no page, because no model supports wireless; the package, if any, opens at once";
    case FirstPage::kConnectionType:
      return "the connection page, because all models have the same connections by cable";
    case FirstPage::kModelList:
      break;
  }
  return "the model list";
}

const char* nameOf(Kind kind) {
  switch (kind) {
    case Kind::kText:
      return "string";
    case Kind::kPath:
      return "path";
    case Kind::kBoolean:
      return "boolean";
    case Kind::kNumberOrText:
      return "string or number";
    case Kind::kDictionary:
      return "dictionary";
    case Kind::kAny:
      break;
  }
  return "any value";
}

const char* nameOf(Need need) {
  if (need == Need::kRequired) return "required";
  return need == Need::kAdvised ? "advised" : "optional";
}

void writeApplication(std::ostream& out, const Report& report) {
  if (report.application.empty()) return;
  out << "\nApplication: " << printable(report.application);
  if (!report.identifier.empty()) out << ", identifier " << printable(report.identifier);
  const char* word = ", for ";
  for (const std::string& platform : report.platforms) {
    out << word << platform;
    word = " and ";
  }
  out << (report.platforms.size() == 1 ? " only" : "");
}

}  // namespace

void writeText(std::ostream& out, const Report& report, std::size_t width) {
  for (const Finding& finding : report.findings)
    writeFinding(out, finding, width);
  writeModels(out, report, width);
  writeApplication(out, report);
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

void writeKeys(std::ostream& out) {
  out << std::left;
  for (const KeyGroup& group : keyGroups()) {
    for (const KeyRule& rule : group.rules) {
      out << std::setw(20) << group.list << std::setw(18) << nameOf(rule.kind) << std::setw(10)
          << nameOf(rule.need) << group.path << rule.key << '\n';
    }
  }
}

void writeTexts(std::ostream& out) {
  for (const ShownText& text : shownTexts()) {
    out << std::left << std::setw(44) << text.key << std::right << std::setw(4);
    if (text.width > 0) {
      out << std::lround(text.width) << " × " << text.lines;
    } else {
      out << '-' << "    ";
    }
    out << (text.hasFallback ? "  English  " : "  key      ") << text.where
        << (text.mostPlaceholders > 0 ? "; %@ once or twice" : "") << '\n';
  }
}

}  // namespace onramp::check
