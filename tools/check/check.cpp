#include "tools/check/check.h"

#include <algorithm>
#include <filesystem>
#include <system_error>
#include <vector>

#include "platform/freedesktop/main_bundle.h"
#include "platform/property_list.h"
#include "tools/check/checks.h"

namespace onramp::check {

namespace {

namespace fs = std::filesystem;

constexpr const char* kUsualName = "Onramp OSX.app";

// The applications at the medium's top, those that look like the wizard first.
std::string findApplication(const std::string& root) {
  std::vector<std::string> names;
  std::error_code error;
  fs::directory_iterator entry(root, error);
  for (; !error && entry != fs::directory_iterator(); entry.increment(error)) {
    const std::string name = entry->path().filename().string();
    if (name.ends_with(".app") && fs::is_directory(entry->path())) names.push_back(name);
  }
  std::sort(names.begin(), names.end());
  for (const std::string& name : names) {
    const auto information =
        loadDictionary((fs::path(root) / name / "Contents/Info.plist").string());
    if (name == kUsualName || (information && information->find("CommonResourcePath"))) return name;
  }
  return names.empty() ? "" : names.front();
}

}  // namespace

Report checkMedium(const std::string& root) {
  std::error_code ignored;
  std::string folder = fs::canonical(root, ignored).string();
  if (folder.empty()) folder = root;
  Report report{.medium = root, .application = findApplication(folder)};
  const std::string application =
      folder + "/" + (report.application.empty() ? kUsualName : report.application);
  setMainBundlePath(application);
  if (report.application.empty()) {
    report.findings.push_back(
        {.id = "application-missing",
         .place = {.file = kUsualName},
         .found = "no application at the medium's top",
         .expected = "the wizard, beside \"MacResources\"",
         .effect = "there is nothing to double-click",
         .remedy = "copy the application there; its usual settings are taken until then"});
  }
  const MediumFiles files(folder, application, report);
  const Lists lists = readLists(files);
  checkApplication(files, lists);
  checkIdentity(lists, report);
  checkModelNames(lists, report);
  describeModels(lists, report);
  checkPackages(files, lists);
  checkTool(files, lists);
  checkTexts(files, lists);
  checkPictures(files);
  files.addLines();
  return report;
}

}  // namespace onramp::check
