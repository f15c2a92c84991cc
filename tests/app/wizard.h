#pragma once

#include <gtest/gtest.h>

#include <memory>
#include <string>

#include "app/OnrampOSXAppDelegate.h"
#include "base/array_controller.h"
#include "pages/ChooseDeviceView.h"
#include "tests/recording/agents.h"
#include "tests/recording/front_end.h"
#include "tests/recording/medium_folder.h"
#include "tests/recording/network.h"

namespace onramp {

inline constexpr const char* kEnglishTexts =
    "MacResources/CDCommonMessage.bundle/Contents/Resources/en.lproj/Localizable.strings";

/// Runs the wizard from a temporary medium on a scripted network. The functions prepare the medium
/// and the network, and read and operate the wizard's window as a person does.
class Wizard : public testing::Test {
 protected:
  void SetUp() override {
    screen.reset();
    network.reset();
    agents.reset();
  }
  void TearDown() override { screen.reset(); }

  /// Writes the property lists of a medium with a package and two models: "All" (USB, wired,
  /// wireless) and "Cable" (USB only). `more` adds entries to the medium resource dictionary.
  void describeTwoModels(const Dictionary& more = {}) const {
    describe({{"All", recording::model(true, true, true)},
              {"Cable", recording::model(true, false, false)}},
             more);
  }

  /// Writes the property lists of a medium with a package and `models`. Each model is a pair of a
  /// name and an entry for the model information, for example one that recording::model() returns.
  void describe(const std::vector<Dictionary::Pair>& models, const Dictionary& more = {}) const {
    std::vector<std::string> names;
    names.reserve(models.size());
    for (const auto& [name, unused] : models)
      names.push_back(name);
    Dictionary resources{
        {"PkgInfo", Dictionary{{"PkgName", "Kestrel.pkg"}, {"PkgLocation", "Pkg"}}},
        {"BonjourNetwork", "_printer._tcp."},
        {"WLANtool", "Setup.app"}};
    for (const auto& [key, value] : more)
      resources = resources.with(key, value);
    medium.describe(resources, recording::containing(names).with("InstallPKG", installPKG),
                    Dictionary(models));
  }

  void launch() {
    delegate = std::make_unique<OnrampOSXAppDelegate>();
    screen.launch(*delegate);
  }

  /// Returns the class of the visible page if exactly one page is visible, otherwise an empty
  /// string.
  [[nodiscard]] std::string page() const {
    const auto& shown = screen.object("mainView").subviews;
    return shown.size() == 1 ? shown.front()->name : "";
  }

  [[nodiscard]] ArrayController& modelList() const {
    return *screen.object("modelListView").content;
  }

  void chooseModel(const std::string& name) const {
    modelList().setSelectedObject(Dictionary{{"model", name}});
  }

  void chooseRow(int row) const { screen.object("connectionTypeRadioButton").selectedRow = row; }

  /// Runs the command of item `index` in the chooser's menu. Item 0 is the button and has none.
  void chooseMenuItem(std::size_t index) const {
    screen.object("deviceListPopupButton").items.at(index).second();
  }

  /// Announces a wireless device of the maker Kestrel at 192.0.2.`host`. Only a search that is
  /// already running finds the device.
  void appear(const std::string& name, const std::string& model, unsigned char host) const {
    const NetServiceRef service = recording::Network::service(name, "_printer._tcp.");
    agents.answers["192.0.2." + std::to_string(host)] = {2};
    network.found(service);
    network.resolves(service, {recording::ipv4Address(192, 0, 2, host)},
                     recording::txtData({"usb_MFG=Kestrel", "usb_MDL=" + model}));
  }

  /// Returns "name address" for every row of the device list, from the top.
  [[nodiscard]] std::vector<std::string> deviceRows() const {
    std::vector<std::string> rows;
    for (const Dictionary& entry : screen.object("deviceListView").content->arrangedObjects()) {
      rows.push_back(entry.string(ChooseDeviceView::kDevice).value_or("?") + ' ' +
                     entry.string(ChooseDeviceView::kLocation).value_or("?"));
    }
    return rows;
  }

  /// Returns the visible buttons from left to right: "[title]" for an enabled button, "(title)" for
  /// a disabled button.
  [[nodiscard]] std::string buttons() const {
    std::string shown;
    for (const char* name : {"leftMostButton", "leftButton", "rightButton", "rightMostButton"}) {
      const recording::Object& button = screen.object(name);
      if (button.hidden) continue;
      shown += (button.enabled ? "[" : "(") + button.text + (button.enabled ? "]" : ")");
    }
    return shown;
  }

  /// Returns the connection page's heading, explanation, pictures and choices, each followed by a
  /// line feed.
  [[nodiscard]] std::string connectionPage() const {
    auto& choices = screen.object("connectionTypeRadioButton").cells;
    std::string shown;
    for (const std::string& part :
         {screen.object("connectionTypeTitle").text,
          screen.object("connectionDescriptionTextField").text,
          screen.object("connectionTypeImage1").imagePath, choices[std::pair(0, 0)],
          screen.object("connectionTypeImage2").imagePath, choices[std::pair(1, 0)]}) {
      shown += part + '\n';
    }
    return shown;
  }

  /// Returns the expected connectionPage() of a model whose cable row has `picture` and `choice`.
  [[nodiscard]] std::string expectedConnectionPage(const std::string& picture,
                                                   const std::string& choice) const {
    const std::string images = medium.path("MacResources/Images/");
    return "INST_TXT_CONNECTIONTYPE\nINST_TXT_CONNECTIONTYPE_DESC\n" + images +
           "wirelessLan.png\nINST_TXT_WIFI\n" + images + picture + '\n' + choice + '\n';
  }

  /// Expects that the desktop was asked to open the package and nothing else, and that the
  /// application terminates a second later.
  void expectPackageOpenedAndQuit() {
    EXPECT_EQ(screen.opened, std::vector{medium.path("Pkg/Kestrel.pkg")});
    EXPECT_FALSE(screen.terminated);
    EXPECT_EQ(screen.delays.back(), 1.0);
    screen.runTimers();
    EXPECT_TRUE(screen.terminated);
  }

  recording::MediumFolder medium;
  recording::FrontEnd& screen = recording::FrontEnd::instance();
  recording::Network& network = recording::Network::instance();
  recording::Agents& agents = recording::Agents::instance();
  Dictionary installPKG;
  std::unique_ptr<OnrampOSXAppDelegate> delegate;
};

}  // namespace onramp
