#pragma once

#include <gtest/gtest.h>

#include <memory>
#include <string>

#include "app/OnrampOSXAppDelegate.h"
#include "base/array_controller.h"
#include "pages/ChooseDeviceView.h"
#include "tests/recording/front_end.h"
#include "tests/recording/medium_folder.h"

namespace onramp {

/// The wizard on a medium of the test's own, seen and used as a person does.
class Wizard : public testing::Test {
 protected:
  void SetUp() override { screen.reset(); }
  void TearDown() override { screen.reset(); }

  /// A medium with a package and the two models "All" (USB, wired, wireless) and "Cable" (USB
  /// only).
  void describeTwoModels(const Dictionary& more = {}) const {
    describe({{"All", recording::model(true, true, true)},
              {"Cable", recording::model(true, false, false)}},
             more);
  }

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
    medium.write("Pkg/Kestrel.pkg", std::string("package"));
    medium.describe(resources, recording::containing(names).with("InstallPKG", installPKG),
                    Dictionary(models));
  }

  void launch() {
    delegate = std::make_unique<OnrampOSXAppDelegate>();
    screen.launch(*delegate);
  }

  /// The class of the page shown; empty for none, or when there is more than one.
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

  /// "name address" of every row of the device list from the top.
  [[nodiscard]] std::vector<std::string> deviceRows() const {
    std::vector<std::string> rows;
    for (const Dictionary& entry : screen.object("deviceListView").content->arrangedObjects()) {
      rows.push_back(entry.string(ChooseDeviceView::kDevice).value_or("?") + ' ' +
                     entry.string(ChooseDeviceView::kLocation).value_or("?"));
    }
    return rows;
  }

  void chooseRow(int row) const { screen.object("connectionTypeRadioButton").selectedRow = row; }

  /// "[title]" of every visible button from left to right, disabled ones as "(title)".
  [[nodiscard]] std::string buttons() const {
    std::string shown;
    for (const char* name : {"leftMostButton", "leftButton", "rightButton", "rightMostButton"}) {
      const recording::Object& button = screen.object(name);
      if (button.hidden) continue;
      shown += (button.enabled ? "[" : "(") + button.text + (button.enabled ? "]" : ")");
    }
    return shown;
  }

  /// The package was handed to the desktop, and the application ends a second later.
  void expectPackageOpenedAndQuit() {
    EXPECT_EQ(medium.opened(1), std::vector{medium.path("Pkg/Kestrel.pkg")});
    EXPECT_FALSE(screen.terminated);
    screen.runTimers();
    EXPECT_TRUE(screen.terminated);
  }

  recording::MediumFolder medium;
  recording::FrontEnd& screen = recording::FrontEnd::instance();
  Dictionary installPKG;
  std::unique_ptr<OnrampOSXAppDelegate> delegate;
};

}  // namespace onramp
