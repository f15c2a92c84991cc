#include <filesystem>
#include <fstream>
#include <iterator>
#include <map>

#include "platform/property_list.h"
#include "tests/app/wizard.h"

namespace onramp {
namespace {

using recording::model;
using StartUp = Wizard;

TEST_F(StartUp, ShowsTheListWhenModelsDiffer) {
  describeTwoModels();
  launch();
  EXPECT_EQ(page(), "ModelListView");
  EXPECT_EQ(buttons(), "[BTN_CANCEL][BTN_NEXT]");
  EXPECT_EQ(screen.log.back(), "key and front");
}

TEST_F(StartUp, SkipsTheListWhenAllModelsShareTheirCables) {
  const char* const kWired = "INST_TXT_USB\nINST_TXT_ETHERNET";
  struct Case {
    std::vector<Dictionary::Pair> models;
    std::string page;
    std::string secondChoice;
  };
  const Case cases[] = {
      {{{"A", model(true, false, true)}}, "ConnectionTypeView", "INST_TXT_USB"},
      {{{"A", model(true, true, true)}, {"B", model(true, true, false)}},
       "ConnectionTypeView",
       kWired},
      {{{"A", model(false, true, true)}, {"B", model(false, true, true)}},
       "ConnectionTypeView",
       "INST_TXT_USB"},
      {{{"A", model(true, true, true)}, {"B", model(true, false, true)}}, "ModelListView", ""},
      {{{"A", model(false, false, true)}, {"B", model(false, false, true)}}, "ModelListView", ""},
      {{{"A", model(true, false, true)},
        {"No identifier", Dictionary{{"Interfaces", Dictionary{{"USB", true}}}}}},
       "ModelListView",
       ""}};
  for (const Case& c : cases) {
    screen.reset();
    describe(c.models);
    launch();
    EXPECT_EQ(page(), c.page);
    if (c.page != "ConnectionTypeView") continue;
    EXPECT_EQ(buttons(), "[BTN_CANCEL][BTN_NEXT]") << "there is no list to go back to";
    EXPECT_EQ(screen.object("connectionTypeRadioButton").cells[std::pair(1, 0)], c.secondChoice);
  }
}

TEST_F(StartUp, OpensThePackageAtOnceWhenNoModelIsWireless) {
  const std::vector<std::vector<Dictionary::Pair>> media = {
      {{"Cable", model(true, true, false)}},
      {},
      {{"No identifier", Dictionary{{"Interfaces", Dictionary{{"WirelessLAN", true}}}}}}};
  for (std::size_t i = 0; i < media.size(); ++i) {
    screen.reset();
    describe(media[i]);
    launch();
    EXPECT_EQ(page(), "");
    EXPECT_EQ(medium.opened(i + 1).size(), i + 1);
    EXPECT_FALSE(medium.modelFile());
    EXPECT_TRUE(medium.optionsFile());
    screen.runTimers();
    EXPECT_TRUE(screen.terminated);
  }
}

TEST_F(StartUp, ListsModelsByTheirExactSpelling) {
  describe({{"abc", model(true, true, true)}, {"ABD", model(true, false, true)}});
  launch();
  ASSERT_EQ(modelList().arrangedObjects().size(), 2U);
  EXPECT_EQ(modelList().arrangedObjects()[0], (Dictionary{{"model", "ABD"}}));
  EXPECT_EQ(modelList().selectionIndex(), 0U);
}

TEST_F(StartUp, ShowsTheTitleThePictureAndTheMenuInTheUsersLanguage) {
  describeTwoModels();
  medium.setEnvironment("LANG", "ja_JP.UTF-8");
  medium.write(
      "MacResources/CDCommonMessage.bundle/Contents/Resources/ja.lproj/Localizable.strings",
      std::string("\"APP_MENU_HIDEOHTERS\" = \"他を隠す\"; \"BTN_NEXT\" = \"次へ\";"));
  medium.write("Onramp OSX.app/Contents/Resources/Background.png", std::string("picture"));
  launch();
  EXPECT_EQ(screen.object("window").text, "Onramp OSX");
  EXPECT_EQ(screen.object("mBackGroundView").imagePath,
            medium.path("Onramp OSX.app/Contents/Resources/Background.png"));
  EXPECT_EQ(screen.object("mBackGroundView").scaling, ImageScaling::kAxesIndependently);
  const Menu menu = mainMenu().itemWithTitle("Onramp OSX").submenu();
  EXPECT_TRUE(menu.itemWithTitle("他を隠す"));
  EXPECT_TRUE(menu.itemWithTitle("Show All")) << "keeps its English title without a translation";
  EXPECT_EQ(buttons(), "[BTN_CANCEL][次へ]");
}

// Puts a property list where an earlier run left one.
void leaveFile(const std::string& file) {
  std::filesystem::create_directories(std::filesystem::path(file).parent_path());
  ASSERT_TRUE(writeDictionaryAtomically({}, file));
}

TEST_F(StartUp, RemovesWhatAnEarlierRunHandedOver) {
  describeTwoModels();
  for (const std::string& file : {medium.modelFilePath(), medium.optionsFilePath()})
    leaveFile(file);
  launch();
  EXPECT_FALSE(medium.modelFile());
  EXPECT_FALSE(medium.optionsFile());
}

// Every file below `folder` with its bytes.
std::map<std::string, std::string> filesBelow(const std::string& folder) {
  std::map<std::string, std::string> files;
  for (const auto& entry : std::filesystem::recursive_directory_iterator(folder)) {
    if (!entry.is_regular_file()) continue;
    std::ifstream file(entry.path(), std::ios::binary);
    files[entry.path().string()] = std::string(std::istreambuf_iterator<char>(file), {});
  }
  return files;
}

TEST_F(StartUp, ComesUpWithWhateverTheMediumLacks) {
  const std::string texts =
      "MacResources/CDCommonMessage.bundle/Contents/Resources/en.lproj/Localizable.strings";
  const std::string files[] = {"MacResources/Common.plist", "MacResources/CDInfo.plist",
                               "MacResources/ModelInfo.plist", "Onramp OSX.app/Contents/Info.plist",
                               texts};
  struct Damage {
    const char* name;
    std::function<void(const std::string&)> apply;
  };
  const Damage damages[] = {
      {"missing", [&](const std::string& f) { std::filesystem::remove(medium.path(f)); }},
      {"truncated",
       [&](const std::string& f) {
         std::filesystem::resize_file(medium.path(f),
                                      std::filesystem::file_size(medium.path(f)) / 2);
       }},
      {"a list",
       [&](const std::string& f) {
         medium.write(f, std::string("<plist version=\"1.0\"><array/></plist>"));
       }},
      {"wrong types", [&](const std::string& f) {
         medium.write(f, Dictionary{{"CommonResourcePath", 1},
                                    {"CDInfo", 1},
                                    {"ModelInfo", 1},
                                    {"PkgInfo", "x"},
                                    {"ContainedModel", "x"},
                                    {"Model", Array{1}},
                                    {"VenderName", true},
                                    {"SystemMax", 3},
                                    {"WLANtool", 2.5}});
       }}};
  const std::string intact = medium.path("Onramp OSX.app/Contents/Info.plist");
  const std::string copy = medium.path("../Info.plist");
  std::filesystem::copy_file(intact, copy);
  for (const std::string& file : files) {
    for (const Damage& damage : damages) {
      SCOPED_TRACE(file + " " + damage.name);
      screen.reset();
      std::filesystem::copy_file(copy, intact, std::filesystem::copy_options::overwrite_existing);
      describeTwoModels();
      medium.write(texts, std::string("\"BTN_NEXT\" = \"Next\";"));
      damage.apply(file);
      const auto before = filesBelow(medium.path(""));
      launch();
      if (file == texts) {
        EXPECT_EQ(buttons(), "[BTN_CANCEL][BTN_NEXT]") << "keys stand for themselves";
        screen.click("rightButton");
      } else {
        // Without its description a medium has no wireless model: the wizard is not needed.
        EXPECT_EQ(page(), "");
        screen.runTimers();
      }
      EXPECT_TRUE(screen.terminated);
      EXPECT_EQ(filesBelow(medium.path("")), before) << "the medium is never written to";
    }
  }
}

TEST_F(StartUp, MakesTheVendorNameOfItsWords) {
  const std::pair<Dictionary, std::string> cases[] = {
      {{{"VenderName", "Kestrel Imaging  Works"}}, "KestrelImagingWorks"},
      {{{"VenderName", 5}}, ""},
      {{}, ""}};
  for (const auto& [resources, expected] : cases) {
    medium.write("MacResources/Common.plist", resources);
    EXPECT_EQ(OnrampOSXAppDelegate::setVenderName(), expected);
  }
}

TEST_F(StartUp, GoesOnWithoutAPageWhoseInterfaceFileIsMissing) {
  describeTwoModels();
  screen.missingInterfaces = {"ModelListView", "ChooseDeviceView"};
  launch();
  EXPECT_EQ(page(), "");
  screen.click("rightMostButton");
  EXPECT_TRUE(screen.terminated) << "with no page, every button quits";
}

Dictionary version(Value major, Value minor, Value bugFix) {
  return Dictionary{{"Major", major}, {"Minor", minor}, {"BugFix", bugFix}};
}

TEST_F(StartUp, NeedsNothingOnTheMedium) {
  launch();
  EXPECT_EQ(page(), "");
  EXPECT_EQ(medium.opened(0), std::vector<std::string>());
  screen.runTimers();
  EXPECT_TRUE(screen.terminated);
}

TEST_F(StartUp, ChecksTheSystemBeforeAnythingElse) {
  const Dictionary none = version("0", "0", "0");
  const struct {
    const char* system;
    Dictionary minimum;
    Dictionary maximum;
    std::string alert;  // a part of the alert's text; empty for a supported system
  } cases[] = {{"10.5.8", version(10, 6, 0), none, "Mac OS X 10.6 or"},
               {"10.6.0", version("10", "6", "0"), none, ""},
               {"10.9.9", version(10, 10, 0), none, "Mac OS X 10.10 or"},
               {"10.6.2", version(10, 6, 3), none, "Mac OS X 10.6.3 or"},
               {"9.9.9", version(10, 0, 0), none, "Mac OS X 10.0 or"},
               {"10.9.5", none, version(10, 9, "X"), ""},
               {"10.10.0", none, version(10, 9, "X"), "Solutions Center"},
               {"10.9.2", none, version(10, 9, 3), ""},
               {"10.9.3", none, version("10", "9", "3"), "Solutions Center"},
               {"11.0", none, version(10, 15, "x"), "Solutions Center"},
               {"10.9", none, version(10, 9, 1), ""},
               {"10.9", none, Dictionary{{"Major", 10}, {"Minor", 9}}, "Solutions Center"},
               {"99.9.9", none, none, ""},
               {"99.9.9", Dictionary{}, Dictionary{{"Minor", 3}}, ""},
               // Outside both: the maximum is looked at first.
               {"10.9.0", version(10, 10, 0), version(10, 8, 0), "Solutions Center"}};
  for (const auto& c : cases) {
    SCOPED_TRACE(std::string(c.system) + ' ' + c.alert);
    screen.reset();
    describeTwoModels(Dictionary{{"SystemMin", c.minimum}, {"SystemMax", c.maximum}});
    medium.setEnvironment("ONRAMP_SYSTEM_VERSION", c.system);
    leaveFile(medium.modelFilePath());
    launch();
    EXPECT_EQ(medium.modelFile().has_value(), !c.alert.empty())
        << "no hand-off file is touched before the check";
    EXPECT_EQ(page(), c.alert.empty() ? "ModelListView" : "");
    ASSERT_EQ(screen.alerts.size(), c.alert.empty() ? 0U : 1U);
    if (c.alert.empty()) continue;
    EXPECT_NE(screen.alerts[0].informativeText.find(c.alert), std::string::npos)
        << screen.alerts[0].informativeText;
    EXPECT_EQ(screen.alerts[0].buttonTitle, "Close");
    EXPECT_EQ(screen.log, (std::vector<std::string>{"center", "close", "alert", "terminate"}));
  }
}

TEST_F(StartUp, FillsTheMinimumIntoAsManyPlacesAsTheTextHas) {
  describeTwoModels(Dictionary{{"SystemMin", version(10, 11, 0)}});
  const std::pair<std::string, std::string> texts[] = {{"%@ bis %@.", "10.11 bis 10.11."},
                                                       {"%@", "10.11"},
                                                       {"neuer", "neuer"},
                                                       {"%@ %@ %@", "%@ %@ %@"}};
  for (const auto& [text, expected] : texts) {
    screen.reset();
    medium.write(
        "MacResources/CDCommonMessage.bundle/Contents/Resources/en.lproj/Localizable.strings",
        "\"INST_TXT_ALERT_OSMIN\" = \"" + text + "\";");
    launch();
    ASSERT_EQ(screen.alerts.size(), 1U);
    EXPECT_EQ(screen.alerts[0].informativeText, expected);
    EXPECT_EQ(screen.alerts[0].messageText,
              "This OS version is not supported.\nSoftware cannot be installed.");
  }
}

}  // namespace
}  // namespace onramp
