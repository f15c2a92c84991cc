#include <filesystem>

#include "tests/app/wizard.h"

namespace onramp {
namespace {

namespace fs = std::filesystem;

using HandOff = Wizard;

Dictionary device(const Value& addresses) {
  return Dictionary{{"display name", "Office Printer"},
                    {"model name", "Kestrel Model 200"},
                    {"IP address list", addresses}};
}

TEST_F(HandOff, OptionsAreTheMediumsWithFiveGuaranteed) {
  medium.write("Onramp OSX.app/Contents/Resources/SupportedKOL.plist",
               Dictionary{{"Country", Dictionary{{"JP", Dictionary{{"Site", 3}}}, {"DE", true}}}});
  const Dictionary none{{"PKG_WebLink", false},
                        {"PKG_KestrelOnline", false},
                        {"PKG_RemoteTool", false},
                        {"PKG_LabelTool", false},
                        {"PKG_FontSet", false}};
  struct Case {
    const char* locale;
    Dictionary onMedium;
    Dictionary expected;
  };
  const Case cases[] = {
      {"en_US.UTF-8", {}, none},
      {"ja_JP.UTF-8", {}, none},
      {"ja_JP.UTF-8",
       {{"PKG_FontSet", false}, {"PKG_KestrelOnline", true}, {"PKG_WebLink", "x"}, {"Own", 5}},
       none.with("PKG_FontSet", true)
           .with("PKG_KestrelOnline", Dictionary{{"Site", 3}})
           .with("PKG_WebLink", "x")
           .with("Own", 5)},
      {"de_DE.UTF-8",
       {{"PKG_FontSet", true}, {"PKG_KestrelOnline", "yes"}},
       none.with("PKG_KestrelOnline", true)},
      {"de_DE.UTF-8", {{"PKG_KestrelOnline", false}}, none},
      {"fr_FR.UTF-8", {{"PKG_KestrelOnline", true}}, none},
      {"zh_CN.UTF-8", {{"PKG_FontSet", false}}, none.with("PKG_FontSet", true)}};
  for (const Case& c : cases) {
    SCOPED_TRACE(c.locale);
    medium.setEnvironment("LANG", c.locale);
    installPKG = c.onMedium;
    describeTwoModels();
    OnrampOSXAppDelegate::copyCDInfo();
    EXPECT_EQ(medium.optionsFile(), c.expected);
  }
}

TEST_F(HandOff, TheWirelessFormNamesTheDeviceItself) {
  describeTwoModels();
  const Dictionary bonjour{
      {"name", "Office Printer"}, {"type", "_printer._tcp."}, {"domain", "local."}};
  const Dictionary network{{"Bonjour", bonjour}, {"IP address", "192.0.2.7"}};
  const Dictionary wireless{
      {"Model", "Kestrel Model 200"}, {"Interface", "WiFi"}, {"Network", network}};
  const Value addresses = Array{"192.0.2.7", "192.0.2.8"};
  const Dictionary fallback{{"Model", "All"}, {"Interface", "Default"}};
  const auto form = [](const std::optional<std::string>& model,
                       const std::optional<Dictionary>& record) {
    return OnrampOSXAppDelegate::instmodelPlistWiFi(model, record);
  };
  EXPECT_EQ(form("All", device(addresses)), wireless);
  EXPECT_EQ(
      form("All", (Dictionary{{"display name", "Office Printer"}, {"IP address list", addresses}})),
      wireless.with("Model", ""));
  EXPECT_EQ(form("All", device(Array{})), fallback);
  EXPECT_EQ(form("All", (Dictionary{{"IP address list", addresses}})), fallback);
  EXPECT_EQ(form("All", std::nullopt), fallback);
  EXPECT_EQ(form(std::nullopt, std::nullopt), fallback.with("Model", ""));

  describeTwoModels(Dictionary{{"BonjourNetwork", 1}});
  EXPECT_EQ(form("All", device(addresses)), fallback) << "the medium names no service type";
}

TEST_F(HandOff, TheSharedFolderIsOpenToEveryoneAndTheUsersOwnIsNot) {
  describeTwoModels();
  const auto permissions = [](const std::string& file) {
    return fs::status(fs::path(file).parent_path()).permissions();
  };
  EXPECT_EQ(OnrampOSXAppDelegate::InstallPKGInfoURL(), medium.optionsFilePath());
  EXPECT_EQ(permissions(medium.optionsFilePath()), fs::perms::all);
  EXPECT_EQ(OnrampOSXAppDelegate::instmodelPlistURL(), medium.modelFilePath());
  EXPECT_EQ(permissions(medium.modelFilePath()) & fs::perms::others_write, fs::perms::none);

  fs::permissions(fs::path(medium.optionsFilePath()).parent_path(), fs::perms::owner_all);
  (void)OnrampOSXAppDelegate::InstallPKGInfoURL();
  EXPECT_EQ(permissions(medium.optionsFilePath()), fs::perms::owner_all)
      << "a folder that was there keeps its permissions";
}

TEST_F(HandOff, ThePackageIsOpenedEvenWhenNothingCanBeWritten) {
  describeTwoModels();
  medium.setEnvironment("XDG_DATA_HOME", "/proc/nowhere");
  medium.setEnvironment("XDG_DATA_DIRS", "/proc/nowhere");
  launch();
  chooseModel("Cable");
  screen.click("rightMostButton");
  expectPackageOpenedAndQuit();
}

TEST_F(HandOff, ASupportAddressThatIsNoneIsNotOpened) {
  describeTwoModels();
  EXPECT_EQ(OnrampOSXAppDelegate::FAQ_URL(), "http://support.kestrel.example/g/d/c2f2/KS7/en/us/");
  medium.write("MacResources/CDInfo.plist", Dictionary{{"KSCSeriesCode", "two words"}});
  EXPECT_EQ(OnrampOSXAppDelegate::FAQ_URL(), std::nullopt);
}

}  // namespace
}  // namespace onramp
