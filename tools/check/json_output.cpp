#include <nlohmann/json.hpp>

#include "tools/check/output.h"

namespace onramp::check {

namespace {

using Json = nlohmann::ordered_json;

constexpr int kForm = 1;

Json jsonOf(const Finding& finding) {
  Json json{{"id", finding.id},
            {"severity", finding.severity == Severity::kError ? "error" : "warning"},
            {"file", finding.place.file},
            {"key", finding.place.key},
            {"found", finding.found},
            {"expected", finding.expected},
            {"effect", finding.effect},
            {"remedy", finding.remedy}};
  if (finding.place.line) json["line"] = *finding.place.line;
  if (finding.place.byte) json["byte"] = *finding.place.byte;
  if (!finding.nearest.empty()) json["nearest"] = finding.nearest;
  return json;
}

const char* nameOf(FirstPage page) {
  switch (page) {
    case FirstPage::kNone:
      return "package";
    case FirstPage::kConnectionType:
      return "connection type";
    case FirstPage::kModelList:
      break;
  }
  return "model list";
}

}  // namespace

void writeJSON(std::ostream& out, const Report& report) {
  Json findings = Json::array();
  for (const Finding& finding : report.findings)
    findings.push_back(jsonOf(finding));
  Json models = Json::array();
  for (const ModelRow& model : report.models) {
    models.push_back({{"name", model.name},
                      {"usb", model.usb},
                      {"wired", model.wired},
                      {"wireless", model.wireless}});
  }
  Json packages = Json::array();
  for (const PackageRow& row : report.packages)
    packages.push_back({{"systems", row.systems}, {"package", row.package}});
  Json languages = Json::array();
  for (const LanguageRow& language : report.languages)
    languages.push_back({{"name", language.name}, {"texts", language.texts}});
  const Json json{{"form", kForm},
                  {"medium", report.medium},
                  {"application", report.application},
                  {"identifier", report.identifier},
                  {"platforms", report.platforms},
                  {"errors", report.count(Severity::kError)},
                  {"warnings", report.count(Severity::kWarning)},
                  {"findings", std::move(findings)},
                  {"start", nameOf(report.start)},
                  {"models", std::move(models)},
                  {"systems", report.systems},
                  {"packages", std::move(packages)},
                  {"languages", std::move(languages)}};
  out << json.dump(2, ' ', false, Json::error_handler_t::replace) << '\n';
}

}  // namespace onramp::check
