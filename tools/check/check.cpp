#include "tools/check/check.h"

#include <filesystem>
#include <system_error>

#include "platform/freedesktop/main_bundle.h"
#include "tools/check/application.h"
#include "tools/check/checks.h"

namespace onramp::check {

namespace fs = std::filesystem;

Report checkMedium(const std::string& root) {
  std::error_code ignored;
  std::string folder = fs::canonical(root, ignored).string();
  if (folder.empty()) folder = root;
  Report report{.medium = root, .application = findApplication(folder)};
  const std::string application =
      folder + "/" + (report.application.empty() ? kUsualName : report.application);
  setMainBundlePath(application);
  if (report.application.empty()) {
    report.findings.push_back({.id = "application-missing",
                               .place = {.file = kUsualName},
                               .found = "no application at the medium's top",
                               .expected = "the wizard, beside \"MacResources\"",
                               .effect = "there is nothing to double-click",
                               .remedy = "copy the application to the medium's top; until then, "
                                         "onramp-check assumes the application's usual settings"});
  }
  const MediumFiles files(folder, application, report);
  const Lists lists = readLists(files);
  describeApplication(files, lists);
  checkApplication(files, lists);
  checkIdentity(lists, report);
  checkModelNames(lists, report);
  checkConnections(lists, report);
  describeModels(lists, report);
  checkRange(lists, report);
  checkPackages(files, lists);
  checkTool(files, lists);
  checkTexts(files, lists);
  checkPictures(files);
  files.withdrawUsedNames();
  files.addLines();
  return report;
}

}  // namespace onramp::check
