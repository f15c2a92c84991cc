// For each input, replaces one file in a copy of the example medium. The input's first byte chooses
// the file, and the other bytes become its contents. onramp-check must then report the models that
// the wizard reads, and the same wireless support for each model.

#include <array>
#include <cstdint>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <string>

#include "media/CommonMessage.h"
#include "media/KSInstallerInfo.h"
#include "media/KSOROSXCD.h"
#include "media/KSOROSXModel.h"
#include "media/medium.h"
#include "tests/recording/medium_folder.h"
#include "tools/check/check.h"

namespace {

using namespace onramp;  // NOLINT(google-build-using-namespace)
namespace fs = std::filesystem;

// The first byte 'a' chooses the first file, 'b' the second, and so on.
constexpr std::array<const char*, 6> kFiles = {
    "Onramp OSX.app/Contents/Info.plist",
    "MacResources/CDCommonInfo.plist",
    "MacResources/CDInfo.plist",
    "MacResources/ModelInfo.plist",
    "MacResources/CDCommonMessage.bundle/Contents/Resources/en.lproj/Localizable.strings",
    "MacResources/Images/usb.png"};

constexpr const char* kTexts = "MacResources/CDCommonMessage.bundle/Contents/Resources/";

struct ExampleMedium : recording::MediumFolder {
  ExampleMedium() {
    fs::copy(ONRAMP_EXAMPLE_MEDIUM, path(""), fs::copy_options::recursive);
    for (const char* language : {"ja", "ko", "zh_CN"})  // two languages are read faster than five
      fs::remove_all(path(std::string(kTexts) + language + ".lproj"));
    write(kFiles[0], Dictionary{{"CFBundleName", "Onramp OSX"},
                                {"CommonResourcePath", "MacResources/CDCommonInfo.plist"}});
  }
};

void require(bool holds) {
  if (!holds) std::abort();
}

void readMedium(const std::string& folder) {
  const check::Report report = check::checkMedium(folder);
  const Dictionary record = KSOROSXCD::initWithCDInfo();
  const auto names = containedModels(record);
  require(record.size() == 5 && report.models.size() == names.size());
  const auto models = KSOROSXModel::modelInfo();
  for (std::size_t i = 0; i < names.size(); ++i) {
    const Dictionary model = KSOROSXModel::initWithName(names[i], models);
    const bool wireless = model.boolean(KSOROSXModel::kSupportWiFi).value_or(false);
    require(report.models[i].name == names[i] && report.models[i].wireless == wireless);
  }
  const KSInstallerInfo installer;
  require(!installer.pkgURL() || installer.WLANtoolURL());
  static_cast<void>(localized("INST_TXT_LOCATION"));
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  static const ExampleMedium medium;
  if (size == 0) return 0;
  const std::string file = medium.path(kFiles[std::uint8_t(data[0] - 'a') % kFiles.size()]);
  fs::rename(file, file + ".whole");
  std::ofstream(file, std::ios::binary)
      .write(reinterpret_cast<const char*>(data) + 1, static_cast<std::streamsize>(size - 1));
  readMedium(medium.path(""));
  fs::rename(file + ".whole", file);
  return 0;
}
