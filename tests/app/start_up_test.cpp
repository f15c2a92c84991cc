#include <gmock/gmock.h>
#include <sys/wait.h>
#include <unistd.h>

#include <filesystem>
#include <fstream>
#include <iterator>
#include <map>

#include "tests/app/wizard.h"

namespace onramp {
namespace {

using recording::model;
using StartUp = Wizard;

TEST_F(StartUp, ListsTheModelsInByteOrderWhenTheirConnectionsDiffer) {
  describe({{"abc", model(true, true, true)}, {"ABD", model(true, false, true)}});
  launch();
  EXPECT_EQ(page(), "ModelListView");
  EXPECT_EQ(screen.object("modelListTitle").text, "INST_TXT_MODEL");
  EXPECT_EQ(screen.object("modelListDescriptionTextField").text, "INST_TXT_MODEL_DESC");
  ASSERT_EQ(modelList().arrangedObjects().size(), 2U);
  EXPECT_EQ(modelList().selectedObject(), (Dictionary{{"model", "ABD"}})) << "capitals come first";
  EXPECT_EQ(modelList().selectionIndex(), 0U);
  EXPECT_EQ(buttons(), "[BTN_CANCEL][BTN_NEXT]");
  EXPECT_EQ(screen.log.back(), "key and front");
}

TEST_F(StartUp, ChoosesTheFirstPageByTheModelsConnections) {
  const std::string wired =
      expectedConnectionPage("wiredLan.png", "INST_TXT_USB\nINST_TXT_ETHERNET");
  const std::string usb = expectedConnectionPage("usb.png", "INST_TXT_USB");
  // Each case has the medium's models and the expected connection page, which is empty if the
  // wizard shows the model list.
  const std::pair<std::vector<Dictionary::Pair>, std::string> cases[] = {
      {{{"A", model(true, false, true)}}, usb},
      {{{"A", model(true, true, false)}, {"B", model(true, true, true)}}, wired},
      {{{"A", model(false, true, true)}, {"B", model(false, true, true)}}, usb},
      {{{"A", model(true, true, true)}, {"B", model(true, false, true)}}, ""},
      {{{"A", model(true, false, true)}, {"B", model(false, true, true)}}, ""},
      {{{"A", model(false, false, true)}, {"B", model(false, false, true)}}, ""},
      {{{"A", model(true, false, true)},
        {"No identifier", Dictionary{{"Interfaces", Dictionary{{"USB", true}}}}}},
       ""}};
  for (const auto& [models, shownPage] : cases) {
    screen.reset();
    describe(models);
    launch();
    EXPECT_EQ(page(), shownPage.empty() ? "ModelListView" : "ConnectionTypeView");
    if (!shownPage.empty()) {
      EXPECT_EQ(connectionPage(), shownPage);
    }
    EXPECT_EQ(buttons(), "[BTN_CANCEL][BTN_NEXT]") << "there is no page to go back to";
  }
}

TEST_F(StartUp, OpensThePackageAtOnceWhenNoModelIsWireless) {
  const std::vector<Dictionary::Pair> media[] = {
      {{"Cable", model(true, true, false)}},
      {},
      {{"No identifier", Dictionary{{"Interfaces", Dictionary{{"WirelessLAN", true}}}}}}};
  for (const auto& models : media) {
    screen.reset();
    describe(models);
    launch();
    EXPECT_EQ(page(), "");
    EXPECT_FALSE(medium.modelFile());
    EXPECT_TRUE(medium.optionsFile());
    expectPackageOpenedAndQuit();
  }
}

TEST_F(StartUp, ShowsTitleAndPictureAndTranslatesTheMenu) {
  describeTwoModels();
  medium.setEnvironment("LANG", "ja_JP.UTF-8");
  medium.write(
      "MacResources/CDCommonMessage.bundle/Contents/Resources/ja.lproj/Localizable.strings",
      std::string("APP_MENU_ABOUT = a; APP_MENU_HIDE = h; APP_MENU_HIDEOHTERS = \"他を隠す\";"
                  "APP_MENU_QUIT = q; BTN_NEXT = \"次へ\";"));
  medium.write("Onramp OSX.app/Contents/Resources/Background.png", std::string("picture"));
  launch();
  EXPECT_EQ(screen.object("window").text, "Onramp OSX");
  EXPECT_EQ(screen.object("mBackGroundView").imagePath,
            medium.path("Onramp OSX.app/Contents/Resources/Background.png"));
  EXPECT_EQ(screen.object("mBackGroundView").scaling, ImageScaling::kAxesIndependently);
  const Menu menu = mainMenu().itemWithTitle("Onramp OSX").submenu();
  for (const char* title : {"a", "h", "他を隠す", "q", "Show All"})
    EXPECT_TRUE(menu.itemWithTitle(title)) << title;
  EXPECT_FALSE(screen.object("window").resizeIndicator);
  EXPECT_EQ(screen.log.front(), "center");
  EXPECT_EQ(buttons(), "[BTN_CANCEL][次へ]");
}

// Returns the contents of every file below `folder`, by path.
std::map<std::string, std::string> filesBelow(const std::string& folder) {
  std::map<std::string, std::string> files;
  for (const auto& entry : std::filesystem::recursive_directory_iterator(folder)) {
    if (!entry.is_regular_file()) continue;
    std::ifstream file(entry.path(), std::ios::binary);
    files[entry.path().string()] = std::string(std::istreambuf_iterator<char>(file), {});
  }
  return files;
}

void leaveFile(const std::string& file) {
  std::filesystem::create_directories(std::filesystem::path(file).parent_path());
  std::ofstream(file) << "left over";
}

TEST_F(StartUp, RemovesTheFilesThatEarlierRunsLeft) {
  describeTwoModels();
  const pid_t ended = fork();  // the identifier of a process that has exited
  if (ended == 0) _exit(0);
  waitpid(ended, nullptr, 0);
  std::vector<std::string> kept;
  for (const std::string& file : {medium.modelFilePath(), medium.optionsFilePath()}) {
    const std::filesystem::path path(file);
    const std::string temporary = path.parent_path() / ("." + path.filename().string() + ".");
    leaveFile(file);
    leaveFile(temporary + std::to_string(ended) + "-0");
    leaveFile(temporary + std::to_string(getpid()) + "-12");
    for (const std::string& other : {temporary + "1-0", temporary + "x-0", file + ".other"}) {
      leaveFile(other);  // may belong to a running process or to another program
      kept.push_back(other);
    }
  }
  std::filesystem::remove(medium.modelFilePath());
  leaveFile(medium.modelFilePath() + "/a folder in the file's place");
  launch();
  std::vector<std::string> found;
  for (const char* const folder : {"../user", "../local"}) {
    for (const auto& [file, bytes] : filesBelow(medium.path(folder)))
      found.push_back(std::filesystem::path(file).lexically_normal());
  }
  EXPECT_THAT(found, testing::UnorderedElementsAreArray(kept));
}

TEST_F(StartUp, CopesWithMissingAndInvalidFiles) {
  const std::string information = "Onramp OSX.app/Contents/Info.plist";
  const std::string missing = "missing";
  const std::string head = "<plist version=\"1.0\"><dict><key>";
  const std::string number = "</key><integer>1</integer><key>";
  std::string wrongTypes = head;
  for (const char* key : {"CommonResourcePath", "CDInfo", "ModelInfo", "PkgInfo", "ContainedModel",
                          "Model", "VenderName", "SystemMax", "WLANtool"}) {
    wrongTypes.append(key).append(number);
  }
  wrongTypes += "last</key><true/></dict></plist>";
  for (const std::string& file :
       {std::string("MacResources/Common.plist"), std::string("MacResources/CDInfo.plist"),
        std::string("MacResources/ModelInfo.plist"), information, std::string(kEnglishTexts)}) {
    for (const std::string& content :
         {missing, head, std::string("<plist version=\"1.0\"><array/></plist>"), wrongTypes}) {
      SCOPED_TRACE(testing::Message() << file << ": " << content);
      screen.reset();
      medium.write(information, Dictionary{{"CommonResourcePath", "MacResources/Common.plist"}});
      describeTwoModels();
      medium.write(file, content);
      if (content == missing) std::filesystem::remove(medium.path(file));
      const auto before = filesBelow(medium.path(""));
      launch();
      if (file == kEnglishTexts) {
        EXPECT_EQ(buttons(), "[BTN_CANCEL][BTN_NEXT]") << "buttons show keys of missing strings";
        screen.click("rightButton");
      } else {
        // No wireless model can be read from such a medium, so the wizard shows no page and quits.
        EXPECT_EQ(page(), "");
        screen.runTimers();
      }
      EXPECT_TRUE(screen.terminated);
      EXPECT_EQ(filesBelow(medium.path("")), before) << "the wizard never writes to the medium";
    }
  }
}

TEST_F(StartUp, RunsWithoutThePagesWhoseInterfaceFilesAreMissing) {
  describeTwoModels();
  screen.missingInterfaces = {"ModelListView", "ChooseDeviceView"};
  launch();
  EXPECT_EQ(page(), "");
  screen.click("rightMostButton");
  EXPECT_TRUE(screen.terminated) << "without a page, the rightmost button quits";
}

Dictionary version(Value major, Value minor, Value bugFix) {
  return Dictionary{{"Major", major}, {"Minor", minor}, {"BugFix", bugFix}};
}

TEST_F(StartUp, ChecksTheSystemVersionFirst) {
  const Dictionary none = version("0", "0", "0");
  // Each case has the running system's version, the minimum, the maximum and part of the expected
  // alert text, which is empty if the system is supported.
  const std::tuple<const char*, Dictionary, Dictionary, std::string> cases[] = {
      {"10.5.8", version(10, 6, 0), none, "Mac OS X 10.6 or"},
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
      // The system is outside both bounds. The maximum is checked first.
      {"10.9.0", version(10, 10, 0), version(10, 8, 0), "Solutions Center"}};
  for (const auto& [system, minimum, maximum, alert] : cases) {
    SCOPED_TRACE(std::string(system) + ' ' + alert);
    screen.reset();
    describeTwoModels(Dictionary{{"SystemMin", minimum}, {"SystemMax", maximum}});
    medium.setEnvironment("ONRAMP_SYSTEM_VERSION", system);
    leaveFile(medium.modelFilePath());
    launch();
    EXPECT_EQ(std::filesystem::exists(medium.modelFilePath()), !alert.empty())
        << "the files of earlier runs are removed only on a supported system";
    EXPECT_EQ(page(), alert.empty() ? "ModelListView" : "");
    ASSERT_EQ(screen.alerts.size(), alert.empty() ? 0U : 1U);
    if (alert.empty()) continue;
    EXPECT_NE(screen.alerts[0].informativeText.find(alert), std::string::npos)
        << screen.alerts[0].informativeText;
    EXPECT_EQ(screen.alerts[0].messageText + screen.alerts[0].buttonTitle,
              "This OS version is not supported.\nSoftware cannot be installed.Close");
    EXPECT_EQ(screen.log, (std::vector<std::string>{"center", "close", "alert", "terminate"}));
  }
}

TEST_F(StartUp, ReplacesOneOrTwoPlaceholdersWithTheMinimumVersion) {
  describeTwoModels(Dictionary{{"SystemMin", version(10, 11, 0)}});
  const std::pair<std::string, std::string> texts[] = {{"%@ to %@.", "10.11 to 10.11."},
                                                       {"%@", "10.11"},
                                                       {"newer", "newer"},
                                                       {"%@ %@ %@", "%@ %@ %@"}};
  for (const auto& [text, expected] : texts) {
    screen.reset();
    medium.write(
        kEnglishTexts,
        "INST_TXT_ALERT_OS = head; BTN_CLOSE = close; INST_TXT_ALERT_OSMIN = \"" + text + "\";");
    launch();
    ASSERT_EQ(screen.alerts.size(), 1U);
    EXPECT_EQ(screen.alerts[0].informativeText, expected);
    EXPECT_EQ(screen.alerts[0].messageText + '|' + screen.alerts[0].buttonTitle, "head|close");
  }
}

}  // namespace
}  // namespace onramp
