#include <gmock/gmock.h>

#include <filesystem>

#include "tests/app/wizard.h"

namespace onramp {
namespace {

namespace fs = std::filesystem;

using HandOff = Wizard;

TEST_F(HandOff, OptionsFileHoldsTheMediumsOptionsAndFiveStandardOnes) {
  medium.write("Onramp OSX.app/Contents/Resources/SupportedKOL.plist",
               Dictionary{{"Country", Dictionary{{"JP", Dictionary{{"Site", 3}}}, {"DE", true}}}});
  const Dictionary none{{"PKG_WebLink", false},
                        {"PKG_KestrelOnline", false},
                        {"PKG_RemoteTool", false},
                        {"PKG_LabelTool", false},
                        {"PKG_FontSet", false}};
  const std::tuple<const char*, Dictionary, Dictionary> cases[] = {
      {"en_US.UTF-8", {{"PKG_FontSet", true}}, none},
      {"ja_JP.UTF-8", {}, none},
      {"ja_JP.UTF-8",
       {{"PKG_FontSet", false}, {"PKG_KestrelOnline", true}, {"PKG_WebLink", "x"}, {"Own", 5}},
       none.with("PKG_FontSet", true)
           .with("PKG_KestrelOnline", Dictionary{{"Site", 3}})
           .with("PKG_WebLink", "x")
           .with("Own", 5)},
      {"de_DE.UTF-8",
       {{"PKG_RemoteTool", true}, {"PKG_LabelTool", 2}, {"PKG_KestrelOnline", "yes"}},
       none.with("PKG_RemoteTool", true).with("PKG_LabelTool", 2).with("PKG_KestrelOnline", true)},
      {"de_DE.UTF-8", {{"PKG_KestrelOnline", false}}, none},
      {"fr_FR.UTF-8", {{"PKG_KestrelOnline", true}}, none},
      {"C.UTF-8", {{"PKG_KestrelOnline", true}}, none},
      {"ko_KR.UTF-8", {{"PKG_FontSet", false}}, none.with("PKG_FontSet", true)},
      {"zh_CN.UTF-8", {{"PKG_FontSet", false}}, none.with("PKG_FontSet", true)}};
  for (const auto& [locale, onMedium, expected] : cases) {
    medium.setEnvironment("LANG", locale);
    installPKG = onMedium;
    describeTwoModels();
    OnrampOSXAppDelegate::copyCDInfo();
    EXPECT_EQ(medium.optionsFile(), expected) << locale;
  }
}

TEST_F(HandOff, ADeviceWithoutUsableDataIsHandedOverLikeACableConnection) {
  describeTwoModels();
  const Value addresses = Array{"192.0.2.7", "192.0.2.8"};
  const Dictionary whole{{"display name", "Office Printer"},
                         {"model name", "Kestrel Model 200"},
                         {"IP address list", addresses}};
  const Dictionary bonjour{
      {"name", "Office Printer"}, {"type", "_printer._tcp."}, {"domain", "local."}};
  const Dictionary wireless{
      {"Model", "Kestrel Model 200"},
      {"Interface", "WiFi"},
      {"Network", Dictionary{{"Bonjour", bonjour}, {"IP address", "192.0.2.7"}}}};
  const Dictionary fallback{{"Model", "All"}, {"Interface", "Default"}};
  const auto form = [](const std::optional<std::string>& model,
                       const std::optional<Dictionary>& record) {
    return OnrampOSXAppDelegate::instmodelPlistWiFi(model, record);
  };
  EXPECT_EQ(form("All", whole), wireless);
  EXPECT_EQ(form("All", whole.with("model name", 5)), wireless.with("Model", ""));
  EXPECT_EQ(form("All", whole.with("IP address list", Array{})), fallback);
  EXPECT_EQ(form("All", whole.with("display name", "")), fallback);
  EXPECT_EQ(form("All", std::nullopt), fallback);
  EXPECT_EQ(form(std::nullopt, std::nullopt), fallback.with("Model", ""));
  describeTwoModels(Dictionary{{"BonjourNetwork", 1}});
  EXPECT_EQ(form("All", whole), fallback) << "the medium names no service type";
}

TEST_F(HandOff, TheSharedFolderIsWritableByEveryoneButTheUsersFolderIsNot) {
  describeTwoModels();
  const auto permissions = [](const std::string& path) { return fs::status(path).permissions(); };
  const std::string shared = fs::path(medium.optionsFilePath()).parent_path();
  const std::string own = fs::path(medium.modelFilePath()).parent_path();
  EXPECT_EQ(OnrampOSXAppDelegate::InstallPKGInfoURL(), medium.optionsFilePath());
  EXPECT_EQ(permissions(shared), fs::perms::all);
  EXPECT_EQ(OnrampOSXAppDelegate::instmodelPlistURL(), medium.modelFilePath());
  EXPECT_EQ(permissions(own) & fs::perms::others_write, fs::perms::none);
  OnrampOSXAppDelegate::copyCDInfo();
  EXPECT_NE(permissions(medium.optionsFilePath()) & fs::perms::others_read, fs::perms::none)
      << "the installer may run as another user";

  fs::permissions(shared, fs::perms::owner_all);
  (void)OnrampOSXAppDelegate::InstallPKGInfoURL();
  EXPECT_EQ(permissions(shared), fs::perms::owner_all)
      << "a folder that exists keeps its permissions";
}

TEST_F(HandOff, TheVendorNameHasNoSpacesAndIsLowerCaseInFileNames) {
  const std::tuple<Dictionary, std::string, std::string> cases[] = {
      {{{"VenderName", "Kestrel Imaging  Works"}}, "KestrelImagingWorks", "kestrelimagingworks"},
      {{{"VenderName", "Ärzte ÜBER ΣΩ Ж\uFF21 ıI"}},
       "ÄrzteÜBERΣΩЖ\uFF21ıI",
       "ärzteüberσωж\uFF41ıi"},
      {{{"VenderName", 5}}, "", ""},
      {{}, "", ""}};
  medium.setEnvironment("LANG", "tr_TR.UTF-8");
  for (const auto& [resources, folder, inFileName] : cases) {
    medium.write("MacResources/Common.plist", resources);
    EXPECT_EQ(OnrampOSXAppDelegate::setVenderName(), folder);
    const std::string path = OnrampOSXAppDelegate::instmodelPlistURL();
    EXPECT_THAT(path, testing::EndsWith("/com." + inFileName + ".instmodel.plist"));
    EXPECT_THAT(path, testing::HasSubstr("/user/" + folder + "/com."));
  }
}

TEST_F(HandOff, ThereIsNoSupportPageForASeriesCodeThatCannotBePartOfAURL) {
  const std::pair<const char*, const char*> cases[] = {
      {"KS7", "KS7"},         {"a%20b", "a%20b"}, {"a#b", "a#b"},
      {"two words", nullptr}, {"50%", nullptr},   {"50%2", nullptr},
      {"a#b#c", nullptr},     {"[x]", nullptr},   {"ü", nullptr}};
  for (const auto& [series, part] : cases) {
    medium.describe({}, Dictionary{{"KSCSeriesCode", series}}, {});
    const std::string address =
        part ? "http://support.kestrel.example/g/d/c2f2/" + std::string(part) + "/en/us/" : "none";
    EXPECT_EQ(OnrampOSXAppDelegate::FAQ_URL().value_or("none"), address);
  }
}

}  // namespace
}  // namespace onramp
