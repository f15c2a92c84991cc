#include <gmock/gmock.h>

#include "bonjour/KSBonjour.h"
#include "bonjour/KSBonjourSearch.h"
#include "bonjour/KSDevice.h"
#include "tests/recording/medium_folder.h"
#include "tests/recording/network.h"

namespace onramp {

namespace {

using ::testing::ElementsAre;
using ::testing::IsEmpty;
using namespace recording;

using Event = std::pair<std::string, NetServiceRef>;

class ServiceRecorder final : public KSBonjourObserver {
 public:
  void addBonjourService(const NetServiceRef& service) override { note("add", service); }
  void removeBonjourService(const NetServiceRef& service) override { note("remove", service); }
  void resolvedBonjourService(const NetServiceRef& service) override { note("resolved", service); }

  std::vector<Event> events;
  std::function<void()> also = [] {};

 private:
  void note(const char* what, const NetServiceRef& service) {
    events.emplace_back(what, service);
    also();
  }
};

class BrowserTest : public ::testing::Test {
 protected:
  BrowserTest() {
    network.reset();
    browser->addKSBonjourObserver(recorder);
    browser->startBrowsing();
  }

  static bool contains(const KSBonjour& b) {
    return b.isServiceContained("Kestrel", "_ipp._tcp.", "local.");
  }
  [[nodiscard]] bool contains() const { return contains(*browser); }

  Network& network = Network::instance();
  std::shared_ptr<KSBonjour> browser = KSBonjour::initWithType("_ipp._tcp.");
  std::shared_ptr<ServiceRecorder> recorder = std::make_shared<ServiceRecorder>();
  NetServiceRef onOne = Network::service("Kestrel", "_ipp._tcp.");
  NetServiceRef onTwo = Network::service("Kestrel", "_ipp._tcp.");
  NetServiceRef onThree = Network::service("Kestrel", "_ipp._tcp.");
};

TEST_F(BrowserTest, AServiceIsForwardedResolvedAndForgotten) {
  network.found(onOne);
  EXPECT_TRUE(contains());
  EXPECT_FALSE(browser->didServiceResolved("Kestrel", "_ipp._tcp.", "local."));
  EXPECT_TRUE(Network::isResolving(onOne));
  EXPECT_EQ(browser->serviceWithName("Kestrel._ipp._tcp.local."), onOne);
  EXPECT_EQ(browser->serviceWithName("Kestrel"), nullptr);

  recorder->also = [this] {
    EXPECT_TRUE(browser->didServiceResolved("Kestrel", "_ipp._tcp.", "local."));
  };
  network.resolves(onOne, {});
  recorder->also = [] {};
  EXPECT_EQ(network.domain, "") << "all domains are searched";
  network.gone(onOne);
  EXPECT_FALSE(contains());
  EXPECT_THAT(recorder->events,
              ElementsAre(Event{"add", onOne}, Event{"resolved", onOne}, Event{"remove", onOne}));
}

TEST_F(BrowserTest, ADuplicateIsCountedAndTheNewestObjectIsKept) {
  network.found(onOne);
  network.found(onTwo);
  EXPECT_FALSE(Network::isResolving(onOne));
  EXPECT_TRUE(Network::isResolving(onTwo));
  EXPECT_EQ(browser->serviceWithName("Kestrel._ipp._tcp.local."), onTwo);
  network.resolves(onTwo, {});

  network.gone(onOne);
  EXPECT_TRUE(browser->didServiceResolved("Kestrel", "_ipp._tcp.", "local."));
  EXPECT_TRUE(Network::isResolving(onTwo));
  network.gone(onTwo);
  EXPECT_FALSE(contains());
  EXPECT_FALSE(Network::isResolving(onTwo));
  EXPECT_THAT(recorder->events,
              ElementsAre(Event{"add", onOne}, Event{"add", onTwo}, Event{"resolved", onTwo},
                          Event{"remove", onTwo}, Event{"remove", onTwo}));
}

TEST_F(BrowserTest, RemovalsWithoutAResolveInBetweenCountOnce) {
  for (const auto& service : {onOne, onTwo, onThree})
    network.found(service);
  for (const auto& service : {onOne, onTwo, onThree})
    network.gone(service);
  EXPECT_TRUE(contains());

  // Only the first of the three removals counted. After the next resolve, it takes two more
  // removals until the service is gone.
  network.resolves(onThree, {});
  network.gone(onOne);
  EXPECT_TRUE(contains());
  network.gone(onOne);
  EXPECT_FALSE(contains());
}

TEST_F(BrowserTest, RemovalsOfUnknownServicesAreForwardedAsNull) {
  network.gone(onOne);
  const NetServiceRef scanner = Network::service("Kestrel", "_scanner._tcp.");
  browser->removeKSNetService({std::string(kRemoveNotification), nullptr, {}});
  browser->removeKSNetService(
      {std::string(kRemoveNotification), nullptr, {{std::string(kServiceInfo), scanner}}});
  EXPECT_THAT(recorder->events, ElementsAre(Event{"remove", nullptr}, Event{"remove", nullptr},
                                            Event{"remove", nullptr}));
}

TEST_F(BrowserTest, StartedBrowsersForwardEachOthersServices) {
  const auto scanners = KSBonjour::initWithType("_scanner._tcp.");
  const auto scannerRecorder = std::make_shared<ServiceRecorder>();
  const auto idle = KSBonjour::initWithType(std::nullopt);
  for (const auto& other : {scanners, idle}) {
    other->addKSBonjourObserver(scannerRecorder);
    other->startBrowsing();
  }

  network.found(onOne);
  network.resolves(onOne, {});
  EXPECT_TRUE(contains());
  EXPECT_FALSE(contains(*scanners));
  network.gone(onOne);
  EXPECT_THAT(scannerRecorder->events,
              ElementsAre(Event{"add", onOne}, Event{"resolved", onOne}, Event{"remove", nullptr}));
  recorder->events.clear();
  browser->addKSNetService({std::string(kAddNotification), nullptr, {}});
  browser->resolvedKSNetService({std::string(kResolvedNotification), nullptr, {}});
  EXPECT_THAT(recorder->events, ElementsAre(Event{"add", nullptr}, Event{"resolved", nullptr}));
}

TEST_F(BrowserTest, StoppingEmptiesTheTableWithoutEventsAndARestartBeginsEmpty) {
  network.found(onOne);
  browser->stopBrowsing();
  EXPECT_FALSE(Network::isResolving(onOne));
  EXPECT_FALSE(contains());
  EXPECT_EQ(browser->serviceWithName("Kestrel._ipp._tcp.local."), nullptr);
  network.found(onOne);
  browser->stopBrowsing();

  browser->startBrowsing();
  network.found(onOne);
  browser->startBrowsing();
  EXPECT_EQ(network.browsers.size(), 1u);
  EXPECT_FALSE(contains());
  network.found(onOne);
  EXPECT_THAT(recorder->events,
              ElementsAre(Event{"add", onOne}, Event{"add", onOne}, Event{"add", onOne}));
}

TEST_F(BrowserTest, AnObserverMayDestroyTheBrowser) {
  recorder->also = [this] { browser.reset(); };
  network.found(onOne);
  EXPECT_EQ(browser, nullptr);
  EXPECT_FALSE(Network::isResolving(onOne));
  EXPECT_THAT(network.browsers, IsEmpty());
}

class DeviceRecorder final : public KSDeviceObserver {
 public:
  void addKSDevice(const Dictionary& device) override { note("add", device); }
  void updateKSDevice(const Dictionary& device) override { note("update", device); }
  void removeKSDevice(const Dictionary& device) override { note("remove", device); }

  std::vector<std::string> events;
  Dictionary last;
  std::function<void()> also = [] {};

 private:
  void note(const char* what, const Dictionary& device) {
    events.push_back(what + (' ' + device.string(KSDevice::kDisplayName).value_or("?")));
    last = device;
    also();
  }
};

class SearchTest : public ::testing::Test {
 protected:
  SearchTest() {
    network.reset();
    browseFor("_ipp._tcp.");
    search->addKSDeviceObserver(recorder);
    search->startBrowsing();
  }
  void TearDown() override { search->stopBrowsing(); }

  void browseFor(const char* type) const { medium.describe({{"BonjourNetwork", type}}, {}, {}); }

  MediumFolder medium;
  Network& network = Network::instance();
  std::shared_ptr<KSBonjourSearch> search = KSBonjourSearch::init();
  std::shared_ptr<DeviceRecorder> recorder = std::make_shared<DeviceRecorder>();
  NetServiceRef onOne = Network::service("Kestrel", "_ipp._tcp.");
};

TEST_F(SearchTest, ADeviceIsReportedWhenItIsResolvedAndWhenItLeaves) {
  network.found(onOne);
  EXPECT_THAT(recorder->events, IsEmpty());
  network.resolves(onOne, {ipv4Address(192, 0, 2, 7)},
                   txtData({"usb_MFG=Kestrel", "usb_MDL=Model 100", "note=Lobby"}));
  EXPECT_THAT(recorder->events, ElementsAre("update Kestrel"));
  EXPECT_EQ(recorder->last, (Dictionary{{"display name", "Kestrel"},
                                        {"model name", "Kestrel Model 100"},
                                        {"bonjour service type", Array{"_ipp._tcp."}},
                                        {"USB_MFG", "Kestrel"},
                                        {"USB_MDL", "Model 100"},
                                        {"location", "Lobby"},
                                        {"device URI", "dnssd://Kestrel._ipp._tcp.local."},
                                        {"IP address list", Array{"192.0.2.7"}}}));
  network.gone(onOne);
  network.gone(onOne);
  EXPECT_THAT(recorder->events, ElementsAre("update Kestrel", "remove Kestrel"));
  EXPECT_EQ(*recorder->last.array(KSDevice::kBonjourServiceType), Array());
}

TEST_F(SearchTest, AResolvedServiceThatNoBrowserHasFoundIsReportedAsAdded) {
  search->resolvedBonjourService(Network::service("Kestrel", "_scanner._tcp."));
  search->resolvedBonjourService(nullptr);
  EXPECT_THAT(recorder->events, ElementsAre("add Kestrel"));
}

TEST_F(SearchTest, ARestartedSearchUsesTheNewTypeAndForgetsOldServices) {
  network.found(onOne);
  EXPECT_EQ(search->supportTypes("Kestrel", "local."), Array{"_ipp._tcp."});
  EXPECT_EQ(search->supportTypes(std::nullopt, "local."), Array());
  search->stopBrowsing();
  EXPECT_EQ(search->supportTypes("Kestrel", "local."), Array());

  browseFor("_pdl-datastream._tcp.");
  search->startBrowsing();
  search->startBrowsing();
  EXPECT_EQ(network.browsers.size(), 1u);
  const NetServiceRef raw = Network::service("Kestrel", "_pdl-datastream._tcp.");
  network.found(raw);
  network.resolves(raw, {});
  EXPECT_THAT(recorder->events, ElementsAre("update Kestrel"));
  EXPECT_EQ(*recorder->last.array(KSDevice::kBonjourServiceType), Array{"_pdl-datastream._tcp."});
}

TEST_F(SearchTest, AnObserverMayDestroyTheSearch) {
  const std::weak_ptr<KSBonjourSearch> first = search;
  recorder->also = [this] {
    search->stopBrowsing();
    search = KSBonjourSearch::init();
  };
  network.found(onOne);
  network.resolves(onOne, {});
  EXPECT_TRUE(first.expired());
  EXPECT_THAT(network.browsers, IsEmpty());
}

TEST(Device, EveryRecordHasAllKeys) {
  const Dictionary none = KSDevice::initWithService(nullptr, std::nullopt);
  EXPECT_EQ(none.size(), 8u);
  EXPECT_EQ(none.string(KSDevice::kModelName), " ");
  EXPECT_EQ(none.string(KSDevice::kDeviceURI), "");

  const NetServiceRef service = Network::service("Kestrel", "_ipp._tcp.");
  Network::fill(service, {ipv6Address()}, txtData({"usb_MFG=Kestrel", "mdl=Model 100"}));
  const Dictionary device = KSDevice::initWithService(service, Array{"_ipp._tcp."});
  EXPECT_EQ(device.size(), 8u);
  EXPECT_EQ(device.string(KSDevice::kModelName), "");
  EXPECT_EQ(device.string(KSDevice::kUSBManufacturer), "Kestrel");
  EXPECT_EQ(device.string(KSDevice::kUSBModel), "");
  EXPECT_EQ(*device.array(KSDevice::kIPAddressList), Array());
}

}  // namespace

}  // namespace onramp
