#include "platform/bundle.h"

#include <filesystem>
#include <system_error>
#include <utility>
#include <vector>

#include "platform/freedesktop/language.h"
#include "platform/freedesktop/main_bundle.h"
#include "platform/freedesktop/strings_table.h"
#include "platform/property_list.h"
#include "platform/user_locale.h"

namespace onramp {

namespace {

namespace fs = std::filesystem;

constexpr std::string_view kLanguageFolder = ".lproj";
constexpr const char* kDefaultDevelopmentLanguage = "en";

bool isFile(const std::string& path) {
  std::error_code ignored;
  return fs::is_regular_file(path, ignored);
}

// Returns the languages that have a folder in the resources folder, in no particular order.
std::vector<std::string> offeredLanguages(const std::string& resources) {
  std::vector<std::string> languages;
  std::error_code error;
  fs::directory_iterator entry(resources, error);
  for (; !error && entry != fs::directory_iterator(); entry.increment(error)) {
    std::string name = entry->path().filename().string();
    if (!name.ends_with(kLanguageFolder)) continue;
    name.resize(name.size() - kLanguageFolder.size());
    languages.push_back(std::move(name));
  }
  return languages;
}

}  // namespace

Bundle Bundle::main() {
  return Bundle(mainBundlePath());
}

std::optional<Bundle> Bundle::open(const std::string& path) {
  std::error_code ignored;
  if (!fs::is_directory(path, ignored)) return std::nullopt;
  std::string folder = fs::absolute(path, ignored).lexically_normal().string();
  if (folder.size() > 1 && folder.ends_with('/')) folder.pop_back();
  return Bundle(std::move(folder));
}

Dictionary Bundle::infoDictionary() const {
  return loadDictionary(path_ + "/Contents/Info.plist").value_or(Dictionary());
}

std::optional<std::string> Bundle::infoString(std::string_view key) const {
  return infoDictionary().string(key);
}

std::optional<std::string> Bundle::localizedInfoString(const std::string& key) const {
  const auto path = pathForResource("InfoPlist", "strings");
  const auto texts = path ? loadStringsTable(*path) : std::nullopt;
  const auto text = texts ? texts->string(key) : std::nullopt;
  return text ? text : infoString(key);
}

std::optional<std::string> Bundle::pathForResource(const std::string& name,
                                                   const std::string& type) const {
  const std::string resources = path_ + "/Contents/Resources/";
  const std::string file = type.empty() ? name : name + "." + type;
  if (isFile(resources + file)) return resources + file;
  const std::string development =
      infoString("CFBundleDevelopmentRegion").value_or(kDefaultDevelopmentLanguage);
  for (const std::string& language :
       languagesToSearch(offeredLanguages(resources), preferredLanguages(), development)) {
    std::string localized = resources;
    localized.append(language).append(kLanguageFolder).append("/").append(file);
    if (isFile(localized)) return localized;
  }
  return std::nullopt;
}

std::optional<std::string> Bundle::executablePath() const {
  const auto name = infoString("CFBundleExecutable");
  if (!name || name->empty()) return std::nullopt;
  std::string own = path_ + "/Contents/Linux/" + *name;
  std::string foreign = path_ + "/Contents/MacOS/" + *name;
  return !isFile(own) && isFile(foreign) ? foreign : own;
}

std::string Bundle::localizedString(const std::string& key, const std::string& value,
                                    const std::optional<std::string>& table) const {
  const auto path = pathForResource(table.value_or("Localizable"), "strings");
  const auto texts = path ? loadStringsTable(*path) : std::nullopt;
  return texts ? texts->string(key).value_or(value) : value;
}

}  // namespace onramp
