#include <gmock/gmock.h>

#include "tests/app/wizard.h"

namespace onramp {
namespace {

using recording::model;
using ::testing::ElementsAre;
using ::testing::IsEmpty;

using Strings = std::vector<std::string>;
using Pauses = std::vector<unsigned>;

const char* const kUSBAndWired = "INST_TXT_USB\nINST_TXT_ETHERNET";

class Navigation : public Wizard {
 protected:
  /// Launches the wizard from a medium with `models` and goes to the connection page of the first
  /// model. The models must differ in their support of USB or wired Ethernet, so that the wizard
  /// shows the model list first.
  void goToConnectionPage(const std::vector<Dictionary::Pair>& models = {
                              {"All", model(true, true, true)},
                              {"Cable", model(true, false, false)}}) {
    describe(models);
    launch();
    chooseModel(models.front().key);
    screen.click("rightMostButton");
    ASSERT_EQ(page(), "ConnectionTypeView");
  }

  /// On the connection page, starts a search that finds nothing. The set-up tool then runs and
  /// exits with `exitStatus`.
  void searchInVainWithTool(int exitStatus) {
    medium.addSetUpTool(exitStatus);
    screen.click("rightMostButton");
    EXPECT_EQ(screen.log.back(), "hide");
    EXPECT_THAT(screen.delays, ElementsAre(0.5));
    screen.log.clear();
    screen.pauses.clear();
    screen.runTimers();
    EXPECT_EQ(medium.setUpToolArguments(), "-installer");
  }
};

TEST_F(Navigation, AModelConnectedByCableIsHandedOverBeforeThePackageOpens) {
  goToConnectionPage();
  EXPECT_EQ(buttons(), "[BTN_CANCEL][BTN_BACK][BTN_NEXT]");
  EXPECT_EQ(connectionPage(), expectedConnectionPage("wiredLan.png", kUSBAndWired));
  EXPECT_EQ(screen.object("connectionTypeRadioButton").selectedRow, 0);
  EXPECT_TRUE(screen.object("progress").hidden);
  EXPECT_TRUE(screen.object("progressTxtField").hidden);
  screen.duringOpening = [&] {
    EXPECT_EQ(medium.modelFile(), (Dictionary{{"Model", "All"}, {"Interface", "Default"}}));
    EXPECT_TRUE(medium.optionsFile());
  };
  chooseRow(1);
  screen.click("rightMostButton");
  expectPackageOpenedAndQuit();
}

TEST_F(Navigation, BackReturnsToTheListWithTheSameModelSelected) {
  describe({{"A", model(true, false, true)}, {"B", model(true, true, true)}});
  launch();
  chooseModel("B");
  screen.click("rightMostButton");
  screen.click("rightButton");
  EXPECT_EQ(page(), "ModelListView");
  EXPECT_EQ(buttons(), "[BTN_CANCEL][BTN_NEXT]");
  EXPECT_EQ(modelList().selectedObject(), (Dictionary{{"model", "B"}}));
  EXPECT_EQ(screen.log.back(), "front");
}

TEST_F(Navigation, CancelQuitsFromEveryPageAndWritesNothing) {
  const auto expectQuitBy = [&](const char* button) {
    screen.click(button);
    EXPECT_TRUE(screen.terminated);
    EXPECT_FALSE(medium.modelFile() || medium.optionsFile());
    EXPECT_THAT(screen.opened, IsEmpty());
    screen.reset();
  };
  goToConnectionPage();
  expectQuitBy("leftButton");
  goToConnectionPage();
  searchInVainWithTool(0);
  expectQuitBy("rightButton");
  launch();
  expectQuitBy("rightButton");
  describe({{"A", model(true, false, true)}});
  launch();
  expectQuitBy("rightButton");
}

// The device joins the network after the set-up tool has run, so only the second search finds it.
TEST_F(Navigation, TheSearchAfterTheToolFindsTheChosenModelsDevice) {
  goToConnectionPage(
      {{"Kestrel Model 100", model(true, true, true)}, {"Kestrel Scan", model(true, false, true)}});
  screen.duringPause = [&](int pause) {
    EXPECT_EQ(buttons(), "(BTN_CANCEL)(BTN_BACK)(BTN_NEXT)") << pause;
    EXPECT_FALSE(screen.object("deviceListPopupButton").enabled);
    EXPECT_FALSE(screen.object("connectionTypeRadioButton").enabled);
    EXPECT_FALSE(delegate->windowShouldClose(Window()));
    const recording::Object& spinner = screen.object("progress");
    EXPECT_TRUE(spinner.animating && !spinner.hidden && !screen.object("progressTxtField").hidden);
    EXPECT_EQ(screen.object("progressTxtField").text, "INST_WAIT");
  };
  medium.addSetUpTool(0);
  screen.click("rightMostButton");
  EXPECT_EQ(screen.pauses, (Pauses{2, 2, 2, 2, 2}));
  EXPECT_EQ(buttons(), "[BTN_CANCEL][BTN_BACK][BTN_NEXT]");
  EXPECT_TRUE(screen.object("deviceListPopupButton").enabled);
  EXPECT_TRUE(screen.object("connectionTypeRadioButton").enabled);
  EXPECT_TRUE(delegate->windowShouldClose(Window()));
  EXPECT_FALSE(screen.object("progress").animating);
  EXPECT_TRUE(screen.object("progress").hidden && screen.object("progressTxtField").hidden);
  EXPECT_THAT(network.browsers, IsEmpty());

  screen.pauses.clear();
  screen.duringPause = [&](int pause) {
    EXPECT_EQ(page(), "ChooseDeviceView");
    EXPECT_TRUE(screen.object("progress").animating);
    if (pause != 2) return;
    appear("Scanner", "Scan", 7);
    appear("Office", "Model 100", 8);
  };
  screen.log.clear();
  screen.runTimers();
  EXPECT_EQ(screen.pauses, (Pauses{3, 3})) << "the wait ends once the device is found";
  EXPECT_EQ(screen.log, (Strings{"key and front", "unhide", "activate", "key and front"}));
  EXPECT_THAT(deviceRows(), ElementsAre("Office 192.0.2.8"));
  EXPECT_THAT(screen.sheets, IsEmpty());
  EXPECT_THAT(network.browsers, IsEmpty());
  EXPECT_EQ(buttons(), "[BTN_CANCEL][BTN_NEXT]") << "there is no Back button after the tool";
  EXPECT_TRUE(screen.object("progress").hidden);

  screen.click("rightMostButton");
  ASSERT_TRUE(medium.modelFile());
  EXPECT_EQ(medium.modelFile()->string("Model"), "Kestrel Model 100");
  EXPECT_EQ(medium.modelFile()->dictionary("Network")->string("IP address"), "192.0.2.8");
  expectPackageOpenedAndQuit();
}

TEST_F(Navigation, WithoutAModelListBackOnTheChooserShowsTheConnectionPage) {
  describe({{"Kestrel Model 100", model(true, true, true)}});
  launch();
  const std::string shared = expectedConnectionPage("wiredLan.png", kUSBAndWired);
  EXPECT_EQ(connectionPage(), shared);
  EXPECT_EQ(buttons(), "[BTN_CANCEL][BTN_NEXT]") << "there is no list to go back to";
  screen.duringPause = [&](int pause) {
    if (pause == 1) appear("Office", "Model 100", 8);
  };
  screen.click("rightMostButton");
  EXPECT_EQ(screen.pauses, (Pauses{2})) << "the wait ends once a device is found";
  EXPECT_EQ(page(), "ChooseDeviceView");
  EXPECT_EQ(buttons(), "[BTN_CANCEL][BTN_BACK][BTN_NEXT]");

  // A refresh that finds nothing disables Next. Going back enables it again.
  screen.duringPause = nullptr;
  screen.pauses.clear();
  chooseMenuItem(2);
  EXPECT_EQ(screen.pauses, (Pauses{3, 3, 3, 3, 3}));
  EXPECT_THAT(deviceRows(), IsEmpty());
  EXPECT_EQ(screen.sheets.size(), 1U);
  EXPECT_EQ(buttons(), "[BTN_CANCEL][BTN_BACK](BTN_NEXT)");
  screen.click("rightButton");
  EXPECT_EQ(connectionPage(), shared);
  EXPECT_EQ(buttons(), "[BTN_CANCEL][BTN_NEXT]");

  chooseRow(1);
  screen.click("rightMostButton");
  EXPECT_FALSE(medium.modelFile()) << "no model was chosen";
  EXPECT_TRUE(medium.optionsFile());
  expectPackageOpenedAndQuit();
}

TEST_F(Navigation, AToolThatAsksToGoBackLeadsToTheConnectionPageWithWirelessSelected) {
  goToConnectionPage();
  searchInVainWithTool(1);
  EXPECT_EQ(connectionPage(), expectedConnectionPage("wiredLan.png", kUSBAndWired));
  EXPECT_EQ(page(), "ConnectionTypeView");
  EXPECT_EQ(buttons(), "[BTN_CANCEL][BTN_BACK][BTN_NEXT]");
  EXPECT_EQ(screen.object("connectionTypeRadioButton").selectedRow, 0);
  EXPECT_EQ(screen.object("connectionTypeRadioButton").selectedColumn, 0);
  EXPECT_EQ(screen.log, (Strings{"unhide", "activate", "key and front"}));

  // After a second search that finds nothing, the tool runs again.
  screen.log.clear();
  screen.click("rightMostButton");
  EXPECT_EQ(screen.log.back(), "hide");
}

TEST_F(Navigation, AToolThatAsksToQuitEndsTheHiddenWizard) {
  goToConnectionPage();
  searchInVainWithTool(2);
  EXPECT_EQ(screen.log, Strings{"terminate"});
  EXPECT_FALSE(medium.optionsFile());
  EXPECT_THAT(screen.opened, IsEmpty());
}

TEST_F(Navigation, TheSheetAfterAnEmptySearchOffersTheSupportPage) {
  goToConnectionPage();
  searchInVainWithTool(0);
  ASSERT_EQ(screen.sheets.size(), 1U);
  const auto& [sheet, didEnd] = screen.sheets[0];
  EXPECT_EQ(sheet.title, "Device not found");
  EXPECT_EQ(sheet.message, "No device could be found over the network\n\nPush the gear button");
  EXPECT_EQ(sheet.defaultButton + '|' + sheet.otherButton, "OK|WEB");
  for (const int answer : {kAlertDefaultReturn, 0, -1000})
    didEnd(answer);
  EXPECT_THAT(screen.opened, IsEmpty()) << "only the second button opens the page";
  medium.setEnvironment("LANG", "ja_JP.UTF-8");
  didEnd(kAlertOtherReturn);
  EXPECT_THAT(screen.opened, ElementsAre("http://support.kestrel.example/g/d/c2f2/KS7/ja/jp/"));
  EXPECT_EQ(buttons(), "[BTN_CANCEL](BTN_NEXT)");

  // The message text is a format string, in which "%%" means a percent sign.
  medium.setEnvironment("LANG", "en_US.UTF-8");
  medium.write(kEnglishTexts,
               std::string("INST_TXT_ALERT_WIFI_DEVICENOTFOUND = \"100%% of 5%%\";"));
  delegate->showListAlertSheet();
  EXPECT_EQ(screen.sheets[1].first.message, "100% of 5%\n\nPush the gear button");
}

TEST_F(Navigation, AToolThatCannotBeStartedLeadsToTheChooser) {
  goToConnectionPage();
  screen.click("rightMostButton");
  screen.runTimers();
  EXPECT_EQ(page(), "ChooseDeviceView");
  EXPECT_EQ(screen.log.back(), "key and front");
}

TEST_F(Navigation, AToolStartedFromTheMenuKeepsTheChooserWhenItAsksToGoBack) {
  goToConnectionPage();
  searchInVainWithTool(0);
  medium.addSetUpTool(1);
  screen.log.clear();
  chooseMenuItem(1);
  screen.runTimers();
  EXPECT_EQ(page(), "ChooseDeviceView");
  EXPECT_EQ(screen.log, (Strings{"hide", "unhide", "activate", "key and front"}));
}

TEST_F(Navigation, TheWaitNotificationSetsTheLengthOfThePauses) {
  goToConnectionPage();
  delegate->showProgressAtChooseDeviceViewByRefresh(
      {.name = {}, .object = nullptr, .userInfo = {{std::string(kWaitTime), 7}}});
  EXPECT_EQ(screen.pauses, (Pauses{7, 7, 7, 7, 7}));
}

TEST_F(Navigation, QuittingDuringTheWaitEndsTheWaitAtOnce) {
  goToConnectionPage();
  screen.duringPause = [](int) { terminateApplication(); };
  screen.click("rightMostButton");
  EXPECT_EQ(screen.pauses.size(), 1U);
  screen.runTimers();
  EXPECT_EQ(medium.setUpToolArguments(), "");
}

}  // namespace
}  // namespace onramp
