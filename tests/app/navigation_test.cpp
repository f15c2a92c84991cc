#include "tests/app/wizard.h"

namespace onramp {
namespace {

using recording::model;

class Navigation : public Wizard {
 protected:
  /// To the connection page with "All" chosen.
  void goToConnectionPage() {
    describeTwoModels();
    launch();
    chooseModel("All");
    screen.click("rightMostButton");
    ASSERT_EQ(page(), "ConnectionTypeView");
  }

  /// From the connection page, by the wireless row, to the set-up tool's end; nothing is found.
  void searchInVainWithTool(int exitStatus) {
    goToConnectionPage();
    medium.addSetUpTool(exitStatus);
    chooseRow(0);
    screen.click("rightMostButton");
    EXPECT_EQ(screen.log.back(), "hide");
    screen.log.clear();
    screen.pauses.clear();
    screen.runTimers();
    EXPECT_EQ(medium.setUpToolArguments(), "-installer");
  }
};

TEST_F(Navigation, AWirelessModelIsAskedForItsConnection) {
  goToConnectionPage();
  EXPECT_EQ(buttons(), "[BTN_CANCEL][BTN_BACK][BTN_NEXT]");
  EXPECT_EQ(screen.object("connectionTypeRadioButton").selectedRow, 0);
  EXPECT_EQ(screen.object("connectionTypeImage2").imagePath,
            medium.path("MacResources/Images/wiredLan.png"));
  EXPECT_TRUE(screen.object("progress").hidden);

  chooseRow(1);
  screen.click("rightMostButton");
  EXPECT_EQ(medium.modelFile(), (Dictionary{{"Model", "All"}, {"Interface", "Default"}}));
  expectPackageOpenedAndQuit();
}

TEST_F(Navigation, BackReturnsToTheModelChosenBefore) {
  describe({{"A", model(true, false, true)}, {"B", model(true, true, true)}});
  launch();
  chooseModel("B");
  screen.click("rightMostButton");
  screen.click("rightButton");
  EXPECT_EQ(page(), "ModelListView");
  EXPECT_EQ(buttons(), "[BTN_CANCEL][BTN_NEXT]");
  EXPECT_EQ(modelList().selectedObject(), (Dictionary{{"model", "B"}}));
}

TEST_F(Navigation, CancelQuitsFromEveryPageAndWritesNothing) {
  const std::function<void()> fromTheList = [&] {
    describeTwoModels();
    launch();
    screen.click("rightButton");
  };
  const std::function<void()> fromTheConnection = [&] {
    goToConnectionPage();
    screen.click("leftButton");
  };
  const std::function<void()> fromTheFirstPage = [&] {
    describe({{"A", model(true, false, true)}});
    launch();
    screen.click("rightButton");
  };
  const std::function<void()> fromTheChooser = [&] {
    searchInVainWithTool(0);
    screen.click("rightButton");
  };
  for (const auto& cancel : {fromTheList, fromTheConnection, fromTheFirstPage, fromTheChooser}) {
    screen.reset();
    cancel();
    EXPECT_TRUE(screen.terminated);
    EXPECT_FALSE(medium.modelFile());
    EXPECT_FALSE(medium.optionsFile());
  }
}

TEST_F(Navigation, TheWaitHoldsTheWindowAndEndsAfterFivePauses) {
  goToConnectionPage();
  screen.duringPause = [&](int pause) {
    EXPECT_EQ(buttons(), "(BTN_CANCEL)(BTN_BACK)(BTN_NEXT)") << pause;
    EXPECT_FALSE(screen.object("deviceListPopupButton").enabled);
    EXPECT_FALSE(delegate->windowShouldClose(Window()));
    EXPECT_TRUE(screen.object("connectionTypeRadioButton").enabled == false);
  };
  screen.click("rightMostButton");
  EXPECT_EQ(screen.pauses, (std::vector<unsigned>{2, 2, 2, 2, 2}));
  EXPECT_EQ(buttons(), "[BTN_CANCEL][BTN_BACK][BTN_NEXT]");
  EXPECT_TRUE(screen.object("deviceListPopupButton").enabled);
  EXPECT_TRUE(screen.object("connectionTypeRadioButton").enabled);
  EXPECT_TRUE(delegate->windowShouldClose(Window()));
}

TEST_F(Navigation, AToolThatAsksToGoBackShowsTheConnectionPageWithWirelessChosen) {
  searchInVainWithTool(1);
  EXPECT_EQ(page(), "ConnectionTypeView");
  EXPECT_EQ(buttons(), "[BTN_CANCEL][BTN_BACK][BTN_NEXT]");
  EXPECT_EQ(screen.object("connectionTypeRadioButton").selectedRow, 0);
  EXPECT_EQ(screen.log, (std::vector<std::string>{"unhide", "activate", "key and front"}));

  // The pass is over: another empty search runs the tool again.
  screen.log.clear();
  screen.click("rightMostButton");
  EXPECT_EQ(screen.log.back(), "hide");
}

TEST_F(Navigation, AToolThatAsksToQuitEndsTheWizardUnseen) {
  searchInVainWithTool(2);
  EXPECT_EQ(screen.log, std::vector<std::string>{"terminate"});
  EXPECT_FALSE(medium.optionsFile());
}

TEST_F(Navigation, AnyOtherToolStatusSearchesAgainOnTheChooser) {
  searchInVainWithTool(0);
  EXPECT_EQ(page(), "ChooseDeviceView");
  EXPECT_EQ(screen.pauses, (std::vector<unsigned>{3, 3, 3, 3, 3}));
  EXPECT_EQ(buttons(), "[BTN_CANCEL](BTN_NEXT)") << "there is no way back after an automatic run";
  EXPECT_EQ(screen.log.back(), "key and front");

  ASSERT_EQ(screen.sheets.size(), 1U);
  EXPECT_EQ(screen.sheets[0].sheet.title, "Device not found");
  EXPECT_EQ(screen.sheets[0].sheet.message,
            "No device could be found over the network\n\nPush the gear button");
  screen.sheets[0].didEnd(kAlertDefaultReturn);
  EXPECT_EQ(medium.opened(0).size(), 0U);
  medium.setEnvironment("LANG", "ja_JP.UTF-8");
  screen.sheets[0].didEnd(kAlertOtherReturn);
  EXPECT_EQ(medium.opened(1),
            std::vector<std::string>{"http://support.kestrel.example/g/d/c2f2/KS7/ja/jp/"});
  EXPECT_EQ(buttons(), "[BTN_CANCEL](BTN_NEXT)");
}

TEST_F(Navigation, AToolThatCannotBeStartedCountsAsAnyOther) {
  goToConnectionPage();
  screen.click("rightMostButton");
  screen.runTimers();
  EXPECT_EQ(page(), "ChooseDeviceView");
  EXPECT_EQ(screen.log.back(), "key and front");
}

TEST_F(Navigation, TheChoosersMenuRefreshesAndStartsTheTool) {
  searchInVainWithTool(0);
  auto& items = screen.object("deviceListPopupButton").items;
  ASSERT_EQ(items.size(), 3U);
  EXPECT_EQ(items[0].first, "Gear");
  EXPECT_EQ(items[1].first, "Setup...") << "named after its file: it was not there at the start";
  EXPECT_EQ(items[2].first, "INST_TXT_REFRESH");

  screen.pauses.clear();
  items[2].second();
  EXPECT_EQ(screen.pauses, (std::vector<unsigned>{3, 3, 3, 3, 3}));
  EXPECT_EQ(screen.sheets.size(), 2U);

  // Started by hand, the tool's wish to go back changes no page.
  medium.addSetUpTool(1);
  screen.log.clear();
  items[1].second();
  screen.runTimers();
  EXPECT_EQ(page(), "ChooseDeviceView");
  EXPECT_EQ(screen.log, (std::vector<std::string>{"hide", "unhide", "activate", "key and front"}));
}

TEST_F(Navigation, QuittingDuringTheWaitEndsItAtOnce) {
  goToConnectionPage();
  screen.duringPause = [](int) { terminateApplication(); };
  screen.click("rightMostButton");
  EXPECT_EQ(screen.pauses.size(), 1U);
  screen.runTimers();
  EXPECT_EQ(medium.setUpToolArguments(), "");
}

}  // namespace
}  // namespace onramp
