#include <gtest/gtest.h>

#include "media/KSInstallerInfo.h"
#include "media/KSOROSXCD.h"
#include "media/KSOROSXModel.h"
#include "media/medium.h"
#include "tests/recording/medium_folder.h"

namespace onramp {
namespace {

using recording::MediumFolder;

TEST(FullPath, BeginsWithTheFolderThatHoldsTheBundle) {
  const std::tuple<const char*, std::optional<std::string>, const char*> cases[] = {
      {"/Volumes/Disc/Setup.app", "MacResources/Images", "/Volumes/Disc/MacResources/Images"},
      {"/Setup.app", "MacResources/Images", "/MacResources/Images"},
      {"/Volumes/Disc/Setup.app", "MacResources/", "/Volumes/Disc/MacResources"},
      {"/Volumes/Disc/Setup.app", std::nullopt, "/Volumes/Disc"},
      {"/Setup.app", std::nullopt, "/"},
      {"Setup.app", "MacResources/", "MacResources"}};
  for (const auto& [bundle, relative, expected] : cases) {
    EXPECT_EQ(medium::fullPath(bundle, relative), expected) << bundle;
  }
}

TEST(MediumDescription, HasADefaultForEveryMissingOrMistypedEntry) {
  const Dictionary info{
      {"ContainedModel", Dictionary{{"ABD", 1}, {"abc", 1}, {"a_", 1}, {"abE", 1}}},
      {"Type", Dictionary{{"Printer", "NO"}, {"TWAIN", 0}}},
      {"KSCSeriesCode", 7}};
  const Dictionary common{{"BonjourNetwork", "_printer._tcp."}};
  const Dictionary expected{{"contained models", Array{"a_", "abc", "ABD", "abE"}},
                            {"support Printer Pacakge", true},
                            {"support Scanner Package", false},
                            {"KSC Series Code", ""},
                            {"bonjour service type for browsing", "_printer._tcp."}};
  EXPECT_EQ(KSOROSXCD::initWithCDInfoPlist(info, common), expected);

  const Dictionary defaults{{"contained models", Array{}},
                            {"support Printer Pacakge", true},
                            {"support Scanner Package", true},
                            {"KSC Series Code", ""},
                            {"bonjour service type for browsing", ""}};
  EXPECT_EQ(KSOROSXCD::initWithCDInfoPlist(std::nullopt, common), defaults)
      << "without the medium's description, even the service type has its default";
  EXPECT_EQ(KSOROSXCD::initWithCDInfoPlist(Dictionary(), std::nullopt), defaults);
}

TEST(ModelRecord, IsReadFromTheModelInformation) {
  const Dictionary interfaces{{"USB", "no"}, {"WiredLAN", 1.0}, {"WirelessLAN", "yes"}};
  const Dictionary info{
      {"Model", Dictionary{{"Plain", Dictionary{{"KSCID", "p"}}},
                           {"Odd", Dictionary{{"KSCID", 5}, {"Interfaces", interfaces}}},
                           {"Nameless", Dictionary{{"Interfaces", interfaces}}}}}};
  const auto record = [](const char* name, Value id, bool usb, bool wired, bool wireless) {
    return Dictionary{{"name", name},
                      {"KSC model ID", std::move(id)},
                      {"support USB", usb},
                      {"support Ethernet", wired},
                      {"support WiFi", wireless}};
  };
  EXPECT_EQ(KSOROSXModel::initWithName("Plain", info), record("Plain", "p", true, false, false));
  EXPECT_EQ(KSOROSXModel::initWithName("Odd", info), record("Odd", 5, true, true, false));
  EXPECT_EQ(KSOROSXModel::initWithName("Other", info), record("Other", "", true, false, false));
  EXPECT_EQ(KSOROSXModel::initWithName("Odd", std::nullopt), record("Odd", "", true, false, false));
  EXPECT_EQ(KSOROSXModel::initWithName("Nameless", info), (Dictionary{{"name", "Nameless"}}))
      << "the record of a listed model without an identifier has only the name";
  EXPECT_EQ(KSOROSXModel::initWithName(std::nullopt, info), Dictionary());
}

TEST(InstallerInformation, ChoosesThePackageForTheRunningSystem) {
  const Dictionary byVersion{{"PkgLocation", "Packages/"},
                             {"104", "4"},
                             {"105", "5"},
                             {"106", "6"},
                             {"107", "7"},
                             {"109", "9"}};
  const std::tuple<const char*, Dictionary, std::optional<std::string>> cases[] = {
      {"10.3.9", byVersion, std::nullopt},
      {"10.4.0", byVersion, "Packages/4"},
      {"10.5.9", byVersion, "Packages/5"},
      {"10.6.0", byVersion, "Packages/6"},
      {"10.7.5", byVersion, "Packages/7"},
      {"10.8.5", byVersion, std::nullopt},  // the medium has no package for 10.8
      {"10.9.0", byVersion, "Packages/9"},
      {"11.0.0", byVersion, "Packages/9"},
      {"100.9.9", byVersion, "Packages/9"},  // version code 0x10099
      {"101.0.0", byVersion, std::nullopt},  // version code above 0x100FF
      {"101.0.0", byVersion.with("PkgName", "all.pkg"), "Packages/all.pkg"},
      {"10.6.8", byVersion.with("PkgName", "all.pkg"), "Packages/all.pkg"},
      {"10.6.8", byVersion.with("PkgName", Array{}), std::nullopt},
      {"10.6.8", Dictionary{{"PkgName", "all.pkg"}}, std::nullopt}};
  for (const auto& [system, package, expected] : cases) {
    MediumFolder medium;
    medium.setEnvironment("ONRAMP_SYSTEM_VERSION", system);
    medium.describe(Dictionary{{"PkgInfo", package}}, {}, {});
    const auto url = KSInstallerInfo().pkgURL();
    EXPECT_EQ(url ? url->path : "none", expected ? medium.path(*expected) : "none") << system;
  }
}

TEST(InstallerInformation, HasADefaultForEveryMissingPart) {
  const Dictionary unbounded{{"Major", "0"}, {"Minor", "0"}, {"BugFix", "0"}};
  MediumFolder medium;
  const KSInstallerInfo unreadable;
  EXPECT_EQ(unreadable.pkgURL(), std::nullopt);
  EXPECT_EQ(unreadable.WLANtoolURL(), std::nullopt);
  EXPECT_EQ(unreadable.supportSystemMin(), unbounded);

  const Dictionary minimum{{"Major", 10}};
  medium.describe(Dictionary{{"SystemMax", "10.9"}, {"SystemMin", minimum}}, {}, {});
  const KSInstallerInfo sparse;
  EXPECT_EQ(sparse.supportSystemMax(), unbounded);
  EXPECT_EQ(sparse.supportSystemMin(), minimum);
  EXPECT_EQ(sparse.WLANtoolURL(), FileURL{medium.path("").substr(0, medium.path("").size() - 1)})
      << "without a tool, the result is the folder that holds the application";
}

}  // namespace
}  // namespace onramp
