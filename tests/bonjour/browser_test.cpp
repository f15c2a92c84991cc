#include <gmock/gmock.h>

#include "bonjour/KSBonjour.h"
#include "tests/recording/network.h"

namespace onramp {

namespace {

using recording::Network;
using ::testing::ElementsAre;
using ::testing::IsEmpty;

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

TEST_F(BrowserTest, RemovalsInQuickSuccessionCountOnce) {
  for (const auto& service : {onOne, onTwo, onThree})
    network.found(service);
  for (const auto& service : {onOne, onTwo, onThree})
    network.gone(service);
  EXPECT_TRUE(contains());

  // Only the first removal counted, so the service is still counted twice. After the next resolve,
  // removals count again.
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
  scanners->addKSBonjourObserver(scannerRecorder);
  scanners->startBrowsing();

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

TEST_F(BrowserTest, StoppingForgetsEverythingWithoutEventsAndARestartBeginsEmpty) {
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

}  // namespace

}  // namespace onramp
