#include "tools/check/application.h"

#include <algorithm>
#include <filesystem>
#include <system_error>
#include <vector>

#include "platform/property_list.h"

namespace onramp::check {

namespace fs = std::filesystem;

bool isWizard(const std::string& root, const std::string& name) {
  const auto information = loadDictionary((fs::path(root) / name / "Contents/Info.plist").string());
  return name == kUsualName || (information && information->find("CommonResourcePath"));
}

std::string findApplication(const std::string& root) {
  std::vector<std::string> names;
  std::error_code error;
  fs::directory_iterator entry(root, error);
  for (; !error && entry != fs::directory_iterator(); entry.increment(error)) {
    const std::string name = entry->path().filename().string();
    std::error_code ignored;
    if (name.ends_with(".app") && fs::is_directory(entry->path(), ignored)) names.push_back(name);
  }
  std::sort(names.begin(), names.end());
  for (const std::string& name : names) {
    if (isWizard(root, name)) return name;
  }
  return names.empty() ? "" : names.front();
}

}  // namespace onramp::check
