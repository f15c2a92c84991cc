#include "tools/devices/medium.h"

#include <algorithm>
#include <filesystem>
#include <iostream>
#include <system_error>

#include "media/KSOROSXCD.h"
#include "media/KSOROSXModel.h"
#include "media/connection_type.h"
#include "platform/freedesktop/main_bundle.h"
#include "tools/check/application.h"
#include "tools/check/spelling.h"
#include "tools/devices/text.h"

namespace onramp::devices {

namespace {

namespace fs = std::filesystem;

std::nullopt_t fail(const std::string& path, const std::string& problem) {
  std::cerr << "onramp-devices: " << inQuotes(path) << ' ' << problem << '\n';
  return std::nullopt;
}

// Returns the models whose users never reach a search. A user who chooses a model without wireless
// gets the package at once. If the wizard begins with the connection page, nobody chooses a model,
// and each search is for all models.
std::vector<std::string> modelsWithoutSearch(const std::vector<std::string>& models) {
  const auto information = KSOROSXModel::modelInfo();
  if (firstPage(models, information) == FirstPage::kConnectionType) return {};
  std::vector<std::string> found;
  for (const std::string& model : models) {
    const Dictionary record = KSOROSXModel::initWithName(model, information);
    if (!record.boolean(KSOROSXModel::kSupportWiFi).value_or(false)) found.push_back(model);
  }
  return found;
}

}  // namespace

std::optional<Medium> readMedium(const std::string& path, const std::vector<std::string>& wanted) {
  std::error_code error;
  const std::string folder = fs::canonical(path, error).string();
  if (error || !fs::is_directory(folder, error)) {
    return fail(path, "is not a folder; give the folder that contains the application");
  }
  const std::string application = check::findApplication(folder);
  if (application.empty()) {
    return fail(path,
                "contains no application; give the folder that contains the wizard's application");
  }
  setMainBundlePath(folder + '/' + application);
  const Dictionary description = KSOROSXCD::initWithCDInfo();
  Medium medium{.path = path,
                .type = description.string(KSOROSXCD::kBonjourServiceType).value_or(""),
                .models = containedModels(description),
                .wanted = wanted};
  if (medium.type.empty()) {
    return fail(path,
                "names no service type to look for; its resource dictionary needs "
                "BonjourNetwork, and CDInfo.plist must be readable; try onramp-check");
  }
  if (medium.models.empty()) return fail(path, "has no models in CDInfo.plist; try onramp-check");
  for (const std::string& model : wanted) {
    if (std::find(medium.models.begin(), medium.models.end(), model) == medium.models.end()) {
      const auto nearest = check::Spelling(medium.models).nearest(model);
      return fail(path, "is a medium without a model " + inQuotes(model) +
                            (nearest ? "; did you mean " + inQuotes(*nearest) + '?'
                                     : "; its models are in CDInfo.plist"));
    }
  }
  if (medium.wanted.empty()) medium.wanted = medium.models;
  medium.choosesModel =
      firstPage(medium.models, KSOROSXModel::modelInfo()) == FirstPage::kModelList;
  medium.withoutSearch = modelsWithoutSearch(medium.models);
  return medium;
}

}  // namespace onramp::devices
