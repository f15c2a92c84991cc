#include "tests/recording/medium_folder.h"

#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <utility>

#include "platform/freedesktop/main_bundle.h"

namespace onramp::recording {

namespace fs = std::filesystem;

MediumFolder::MediumFolder() {
  setEnvironment("XDG_DATA_HOME", root_ / "user");
  setEnvironment("XDG_DATA_DIRS", root_ / "local");
  setEnvironment("ONRAMP_SYSTEM_VERSION", "10.9.5");
  for (const char* variable : {"LANGUAGE", "LC_ALL", "LC_MESSAGES"}) {
    setEnvironment(variable, std::nullopt);
  }
  setEnvironment("LANG", "en_US.UTF-8");

  write("Onramp OSX.app/Contents/Info.plist",
        Dictionary{{"CFBundleName", "Onramp OSX"},
                   {"CommonResourcePath", "MacResources/Common.plist"}});
  setMainBundlePath(path("Onramp OSX.app"));
}

MediumFolder::~MediumFolder() {
  for (const auto& [name, value] : std::exchange(before_, {}))
    setEnvironment(name, value);
}

void MediumFolder::write(const std::string& relative, const std::string& bytes) const {
  fs::create_directories(fs::path(path(relative)).parent_path());
  std::ofstream(path(relative), std::ios::binary) << bytes;
}

void MediumFolder::write(const std::string& relative, const Dictionary& dictionary) const {
  fs::create_directories(fs::path(path(relative)).parent_path());
  if (!writeDictionaryAtomically(dictionary, path(relative))) std::abort();
}

void MediumFolder::makeExecutable(const std::string& relative) const {
  fs::permissions(path(relative), fs::perms::owner_all);
}

void MediumFolder::describe(const Dictionary& resources, const Dictionary& cdInfo,
                            const Dictionary& modelInfo) const {
  write("MacResources/Common.plist", resources.with("CDInfo", "MacResources/CDInfo.plist")
                                         .with("ModelInfo", "MacResources/ModelInfo.plist")
                                         .with("VenderName", "Kestrel Imaging"));
  write("MacResources/CDInfo.plist", cdInfo);
  write("MacResources/ModelInfo.plist", Dictionary{{"Model", modelInfo}});
}

void MediumFolder::addSetUpTool(int status) const {
  write("Setup.app/Contents/Info.plist",
        Dictionary{{"CFBundleExecutable", "setup"}, {"CFBundleDisplayName", "Wireless Setup"}});
  write("Setup.app/Contents/Linux/setup", "#!/bin/sh\nprintf '%s' \"$*\" > '" + root_ / "tool" +
                                              "'\nexit " + std::to_string(status) + "\n");
  makeExecutable("Setup.app/Contents/Linux/setup");
}

std::string MediumFolder::setUpToolArguments() const {
  std::string arguments;
  std::getline(std::ifstream(root_ / "tool"), arguments);
  return arguments;
}

void MediumFolder::setEnvironment(const std::string& name,
                                  const std::optional<std::string>& value) {
  const char* const current = std::getenv(name.c_str());
  before_.try_emplace(name, current ? std::optional<std::string>(current) : std::nullopt);
  if (value) {
    setenv(name.c_str(), value->c_str(), 1);
  } else {
    unsetenv(name.c_str());
  }
}

Dictionary model(bool usb, bool wired, bool wireless) {
  return Dictionary{
      {"KSCID", "k1"},
      {"Interfaces", Dictionary{{"USB", usb}, {"WiredLAN", wired}, {"WirelessLAN", wireless}}}};
}

Dictionary containing(const std::vector<std::string>& models) {
  std::vector<Dictionary::Pair> pairs;
  pairs.reserve(models.size());
  for (const std::string& name : models)
    pairs.emplace_back(name, Dictionary());
  return Dictionary{{"ContainedModel", Dictionary(std::move(pairs))}, {"KSCSeriesCode", "KS7"}};
}

}  // namespace onramp::recording
