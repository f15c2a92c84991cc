#include <gmock/gmock.h>

#include <array>
#include <cstdlib>
#include <random>
#include <set>
#include <utility>

#include "tests/app/wizard.h"
#include "tests/recording/agents.h"
#include "tests/recording/network.h"

namespace onramp {
namespace {

using recording::Agents;
using recording::Network;

constexpr int kDevices = 12;
constexpr unsigned kMostPauses = 5;

/// Devices come, go, move and change at random while somebody uses the wizard at random, and the
/// list is held against the rules for it.
class ChooserSoak : public Wizard {
 protected:
  struct Device {
    NetServiceRef service;   // null while it is away
    unsigned char host = 0;  // of its address, 192.0.2.0/24
    bool matches = false;
    bool wireless = false;
  };

  void SetUp() override {
    Wizard::SetUp();
    Network::instance().reset();
    Agents::instance().reset();
    const Dictionary model = recording::model(true, false, true);
    describe({{"Kestrel Model 100", model}, {"Kestrel Scan", recording::model(true, true, false)}});
  }

  [[nodiscard]] int random(int below) {
    return std::uniform_int_distribution<int>(0, below - 1)(generator_);
  }

  void come(Device& device, int number) {
    if (device.service) return;
    device.host = static_cast<unsigned char>(1 + random(250));
    device.matches = random(3) == 0;
    device.wireless = random(3) == 0;
    device.service = Network::service("Device " + std::to_string(number), "_printer._tcp.");
    network.found(device.service);
  }

  // A service that browsing has found, or finds again, resolves when the network answers.
  void resolve(const Device& device, int number) {
    if (!device.service || !Network::isResolving(device.service)) return;
    const std::string address = "192.0.2." + std::to_string(device.host);
    Agents::instance().answers[address] = {device.wireless ? 2 : 1};
    network.resolves(device.service, {recording::ipv4Address(192, 0, 2, device.host)},
                     recording::txtData({"usb_MFG=Kestrel", device.matches ? "usb_MDL=Model 100"
                                                                           : "usb_MDL=Model 10"}));
    if (device.matches && device.wireless) {
      expected.insert("Device " + std::to_string(number) + ' ' + address);
    }
  }

  // The record of a device that is gone names no service types any more, so that no entry equals
  // the one made of it: what was listed stays until a refresh.
  void go(Device& device) {
    if (device.service) network.gone(std::exchange(device.service, nullptr));
  }

  void oneEvent() {
    ++events;
    const int number = random(kDevices);
    Device& device = devices[static_cast<std::size_t>(number)];
    switch (random(4)) {
      case 0:
        return come(device, number);
      case 1:
        return go(device);
      default:
        return resolve(device, number);
    }
  }

  void pause() {
    ++pausesOfThisWait_;
    EXPECT_LE(pausesOfThisWait_, kMostPauses);
    EXPECT_TRUE(listWasEmpty_ || pausesOfThisWait_ == 1) << "the wait should be over";
    if (pausesOfThisWait_ == 1) {
      for (const Device& device : devices)
        if (device.service) network.found(device.service);
    }
    for (int i = random(8); i > 0; --i)
      oneEvent();
    listWasEmpty_ = expected.empty();
    EXPECT_THAT(deviceRows(), ::testing::UnorderedElementsAreArray(expected));
    EXPECT_FALSE(delegate->windowShouldClose(Window()));
  }

  /// One step of the person: everything that starts a search.
  void use() {
    pausesOfThisWait_ = 0;
    listWasEmpty_ = true;
    if (page() == "ConnectionTypeView") {
      medium.addSetUpTool(random(2));
      screen.click("rightMostButton");
      pausesOfThisWait_ = 0;
      screen.runTimers();
    } else if (!screen.object("rightButton").hidden &&
               screen.object("rightButton").text == "BTN_BACK" && random(2) == 0) {
      screen.click("rightButton");
    } else {
      expected.clear();
      screen.object("deviceListPopupButton").items[2].second();
    }
    EXPECT_TRUE(delegate->windowShouldClose(Window()));
    EXPECT_TRUE(screen.object("rightButton").enabled);
    EXPECT_TRUE(screen.object("deviceListPopupButton").enabled);
    EXPECT_TRUE(network.browsers.empty());
    if (page() == "ChooseDeviceView") {
      EXPECT_EQ(screen.object("rightMostButton").enabled, !expected.empty());
    }
  }

  void run(unsigned seed, int count) {
    generator_.seed(seed);
    screen.reset();
    devices = {};
    expected.clear();
    events = 0;
    launch();
    chooseModel("Kestrel Model 100");
    screen.click("rightMostButton");
    screen.duringPause = [this](int) { pause(); };
    while (events < count && !HasFailure())
      use();
  }

  Network& network = Network::instance();
  std::array<Device, kDevices> devices;
  std::set<std::string> expected;
  int events = 0;

 private:
  std::mt19937 generator_;
  unsigned pausesOfThisWait_ = 0;
  bool listWasEmpty_ = true;  ///< after the pause before
};

TEST_F(ChooserSoak, TheListIsWhatTheRulesGiveAndEveryWaitEnds) {
  const char* const wanted = std::getenv("ONRAMP_SOAK_EVENTS");
  const int count = wanted ? static_cast<int>(std::strtol(wanted, nullptr, 10)) : 1000;
  for (unsigned seed = 1; seed <= 3; ++seed) {
    SCOPED_TRACE(seed);
    run(seed, count);
    if (HasFailure()) return;
  }
}

}  // namespace
}  // namespace onramp
