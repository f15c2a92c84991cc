#include "tools/devices/medium.h"

#include <algorithm>
#include <filesystem>
#include <iostream>
#include <system_error>

#include "media/KSOROSXCD.h"
#include "platform/freedesktop/main_bundle.h"
#include "platform/property_list.h"
#include "tools/devices/text.h"

namespace onramp::devices {

namespace {

namespace fs = std::filesystem;

// The application at the medium's top that names the medium's resources.
std::optional<std::string> findApplication(const std::string& folder) {
  std::vector<std::string> found;
  std::error_code error;
  fs::directory_iterator entry(folder, error);
  for (; !error && entry != fs::directory_iterator(); entry.increment(error)) {
    const std::string path = entry->path().string();
    if (!path.ends_with(".app")) continue;
    const auto information = loadDictionary(path + "/Contents/Info.plist");
    if (information && information->find("CommonResourcePath")) found.push_back(path);
  }
  if (found.empty()) return std::nullopt;
  return *std::min_element(found.begin(), found.end());
}

std::nullopt_t fail(const std::string& path, const std::string& problem) {
  std::cerr << "onramp-devices: " << inQuotes(path) << ' ' << problem << '\n';
  return std::nullopt;
}

}  // namespace

std::optional<Medium> readMedium(const std::string& path, const std::vector<std::string>& wanted) {
  std::error_code error;
  const std::string folder = fs::canonical(path, error).string();
  if (error || !fs::is_directory(folder, error)) {
    return fail(path, "is no folder; give the folder that holds the application");
  }
  const auto application = findApplication(folder);
  if (!application) {
    return fail(path,
                "holds no application that names the medium's resources; give the folder "
                "that holds the application");
  }
  setMainBundlePath(*application);
  const Dictionary description = KSOROSXCD::initWithCDInfo();
  Medium medium{.path = path,
                .type = description.string(KSOROSXCD::kBonjourServiceType).value_or(""),
                .models = containedModels(description),
                .wanted = wanted};
  if (medium.type.empty()) {
    return fail(path,
                "names no service type to look for; its resource dictionary needs "
                "BonjourNetwork, and CDInfo.plist has to be readable; try onramp-check");
  }
  if (medium.models.empty()) return fail(path, "has no models in CDInfo.plist; try onramp-check");
  for (const std::string& model : wanted) {
    if (std::find(medium.models.begin(), medium.models.end(), model) == medium.models.end()) {
      return fail(path, "has no model " + inQuotes(model) + "; its models are in CDInfo.plist");
    }
  }
  if (medium.wanted.empty()) medium.wanted = medium.models;
  return medium;
}

}  // namespace onramp::devices
