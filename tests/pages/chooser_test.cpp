#include <gmock/gmock.h>

#include "base/notification_center.h"
#include "bonjour/KSDevice.h"
#include "tests/app/wizard.h"

namespace onramp {
namespace {

using recording::Agents;
using ::testing::ElementsAre;
using ::testing::IsEmpty;
using ::testing::Pair;

constexpr int kSilent = Agents::kSilent;
constexpr int kWired = 1;
constexpr int kWireless = 2;

Dictionary device(const std::string& name, const Array& addresses = {"192.0.2.1"},
                  const std::string& maker = "Kestrel", const std::string& model = "Model 100") {
  return Dictionary{{KSDevice::kDisplayName, name},
                    {KSDevice::kUSBManufacturer, maker},
                    {KSDevice::kUSBModel, model},
                    {KSDevice::kIPAddressList, addresses}};
}

class Chooser : public Wizard {
 protected:
  void SetUp() override {
    Wizard::SetUp();
    for (const char* address : {"192.0.2.1", "192.0.2.2", "192.0.2.3"})
      agents.answers[address] = {kWireless};
    describeTwoModels();
    delegate = std::make_unique<OnrampOSXAppDelegate>();
    load();
    page->setSearchModelList({"Kestrel Model 50", "Kestrel Model 100"});
  }
  void load() {
    page = std::static_pointer_cast<ChooseDeviceView>(delegate->loadView("ChooseDeviceView"));
  }
  void TearDown() override {
    page->stopBrowsing();
    Wizard::TearDown();
  }

  /// Returns the rows from the top. The selected row ends with a star.
  [[nodiscard]] std::vector<std::string> rows() const {
    std::vector<std::string> rows = deviceRows();
    const auto selected = screen.object("deviceListView").content->selectionIndex();
    if (selected) rows.at(*selected) += '*';
    return rows;
  }

  std::shared_ptr<ChooseDeviceView> page;
};

TEST_F(Chooser, ShowsItsTextsAndItsMenu) {
  medium.write(kEnglishTexts, std::string("INST_TXT_DEVICE = name; INST_TXT_CONNECTION = way;"
                                          "INST_TXT_IPADDRESS = place; INST_TXT_REFRESH = again;"));
  load();
  EXPECT_EQ(screen.object("deviceListTitle").text, "INST_TXT_DEVLIST");
  EXPECT_TRUE(screen.object("progress").hidden && screen.object("progressTxtField").hidden);
  const recording::Object& table = screen.object("deviceListView");
  EXPECT_THAT(table.headers, ElementsAre(Pair("device", "name"), Pair("interface", "way"),
                                         Pair("location", "place")));
  EXPECT_THAT(table.fixedColumns, ElementsAre("device", "interface", "location"));
  EXPECT_FALSE(table.columnsCanMove || table.columnsCanBeSelected);

  const auto commands = [&] {
    std::vector<std::string> titles;
    for (const auto& [title, command] : screen.object("deviceListPopupButton").items)
      titles.push_back(title);
    return titles;
  };
  EXPECT_THAT(commands(), ElementsAre("Gear", "Setup...", "again"))
      << "the menu shows the file name of a tool without a display name";
  medium.addSetUpTool(0);
  load();
  EXPECT_THAT(commands(), ElementsAre("Gear", "Wireless Setup...", "again"));
  medium.setEnvironment("LANG", "de_DE.UTF-8");
  medium.write("Setup.app/Contents/Resources/de.lproj/InfoPlist.strings",
               std::string("CFBundleDisplayName = Einrichtung;"));
  load();
  EXPECT_THAT(commands(), ElementsAre("Gear", "Einrichtung...", "again"));
}

TEST_F(Chooser, ListsOnlyDevicesOfTheModelsItSearchesFor) {
  const std::tuple<const char*, const char*, bool> cases[] = {{"Kestrel", "Model 100", true},
                                                              {"Kestrel Model", "100", true},
                                                              {"kestrel", "Model 100", false},
                                                              {"Kestrel", " Model 100", false},
                                                              {"Kestrel", "Model 100 ", false},
                                                              {"", "Kestrel Model 100", false},
                                                              {"", "", false}};
  for (const auto& [maker, model, listed] : cases) {
    agents.asked.clear();
    const Dictionary found = device("D", {"192.0.2.1"}, maker, model);
    page->updateKSDevice(found);
    EXPECT_EQ(page->deviceArrayControllerCnt(), listed ? 1U : 0U) << maker << '|' << model;
    EXPECT_EQ(agents.asked.size(), listed ? 1U : 0U)
        << "the chooser asks only devices of these models";
    page->removeKSDevice(found);
    EXPECT_THAT(rows(), IsEmpty());
  }
  page->setSearchModelList({});
  page->updateKSDevice(device("D"));
  EXPECT_THAT(rows(), IsEmpty());
}

TEST_F(Chooser, TheFirstAddressThatAnswersEveryRequestDecides) {
  // Each case has the answers of each address, the number of requests to each address, and whether
  // the device is listed.
  const std::tuple<std::vector<std::vector<int>>, std::vector<std::size_t>, bool> cases[] = {
      {{}, {}, false},
      {{{kWireless}}, {1}, true},
      {{{kWired}}, {1}, false},
      {{{0}}, {1}, false},
      {{{kWireless}, {kWired}}, {1, 0}, true},
      {{{kWired}, {kWireless}}, {1, 0}, false},
      {{{kSilent}}, {6}, false},
      {{{kSilent}, {kWireless}, {kWired}}, {6, 1, 0}, true},
      {{{kSilent}, {kWired}, {kWireless}}, {6, 1, 0}, false},
      {{{kSilent}, {kSilent}, {kWireless}}, {6, 6, 1}, true},
      // An address that leaves any request unanswered is tried three times, even if it answers
      // later requests. If every address leaves requests unanswered, the last try of the last
      // address decides.
      {{{kSilent, kWireless}}, {4}, true},
      {{{kSilent, kWireless}, {kWired}}, {4, 1}, false},
      {{{kSilent, kWireless}, {kSilent}}, {4, 6}, false},
  };
  for (const auto& [answers, asked, listed] : cases) {
    agents.reset();
    Array addresses;
    std::vector<std::string> expected;
    for (std::size_t i = 0; i < answers.size(); ++i) {
      const std::string address = "198.51.100." + std::to_string(i);
      addresses.emplace_back(address);
      agents.answers[address] = answers[i];
      expected.insert(expected.end(), asked[i], address);
    }
    EXPECT_EQ(ChooseDeviceView::doesWiFi(device("D", addresses)), listed)
        << ::testing::PrintToString(answers);
    EXPECT_EQ(agents.asked, expected);
  }
}

TEST_F(Chooser, SortsByNameAndSelectsTheFirstRowUntilTheUserChoosesOne) {
  for (const char* name : {"b", "C", "a"})
    page->updateKSDevice(device(name));
  EXPECT_THAT(rows(), ElementsAre("C 192.0.2.1*", "a 192.0.2.1", "b 192.0.2.1"));
  EXPECT_EQ(page->choosedDevice()->string("interface"), "Network");
  screen.object("deviceListView").content->choose(2);
  for (const char* name : {"a", "b", "C"})
    page->updateKSDevice(device(name));
  EXPECT_THAT(rows(), ElementsAre("C 192.0.2.1", "a 192.0.2.1", "b 192.0.2.1*"));
  page->removeKSDevice(device("b"));
  page->updateKSDevice(device("B"));
  EXPECT_THAT(rows(), ElementsAre("B 192.0.2.1*", "C 192.0.2.1", "a 192.0.2.1"));
}

TEST_F(Chooser, AnUpdateWithAnotherAddressKeepsTheOldEntry) {
  page->updateKSDevice(device("D", {"192.0.2.1", "192.0.2.2"}));
  page->updateKSDevice(device("D", {"192.0.2.2"}));
  EXPECT_THAT(rows(), ElementsAre("D 192.0.2.1*", "D 192.0.2.2"));
  page->removeKSDevice(device("D", {"192.0.2.2"}));
  EXPECT_THAT(rows(), ElementsAre("D 192.0.2.1*"));
  // The listed record has two addresses, so it does not equal a record with only one of them.
  page->removeKSDevice(device("D", {"192.0.2.1"}));
  EXPECT_THAT(rows(), ElementsAre("D 192.0.2.1*"));
}

TEST_F(Chooser, NeitherAnUpdateNorARemovalOfAWiredDeviceChangesTheList) {
  const Dictionary found = device("D");
  page->updateKSDevice(found);
  agents.answers["192.0.2.1"] = {kWired};
  page->updateKSDevice(found);
  EXPECT_THAT(rows(), ElementsAre("D 192.0.2.1*"));
  page->removeKSDevice(device("Wired"));
  EXPECT_THAT(rows(), ElementsAre("D 192.0.2.1*"));
}

TEST_F(Chooser, OneSearchAtATimeFillsTheListAndOnlyARefreshEmptiesIt) {
  page->startBrowsing();
  page->startBrowsing();
  EXPECT_EQ(network.browsers.size(), 1U);
  appear("A", "Model 100", 1);
  page->stopBrowsing();
  page->stopBrowsing();
  EXPECT_THAT(network.browsers, IsEmpty());
  appear("B", "Model 100", 1);
  EXPECT_THAT(rows(), ElementsAre("A 192.0.2.1*"));

  page->startBrowsing();
  chooseMenuItem(1);
  EXPECT_THAT(network.browsers, IsEmpty()) << "the set-up tool's command stops the search";

  int asked = 0;
  NotificationCenter::defaultCenter().addObserver(
      this, kDeviceWaitNotification, [&](const Notification& wait) {
        ++asked;
        EXPECT_EQ(wait.object, page.get());
        EXPECT_EQ(std::any_cast<int>(wait.userInfo.find(kWaitTime)->second), 3);
        EXPECT_THAT(rows(), IsEmpty());
        EXPECT_EQ(network.browsers.size(), 1U);
      });
  page->refreshBrowsing();
  NotificationCenter::defaultCenter().removeObserver(this);
  EXPECT_EQ(asked, 1);
}

}  // namespace
}  // namespace onramp
