// Tests how corefoundation, cfnetwork and systemconfiguration in platform/ use the objects of the
// macOS frameworks. The folder frameworks/ has stand-ins for these frameworks.

#include <CoreServices/CoreServices.h>
#include <SystemConfiguration/SystemConfiguration.h>
#include <gmock/gmock.h>

#include <chrono>

#include "platform/corefoundation/convert.h"
#include "platform/dynamic_store.h"
#include "platform/net_service.h"
#include "tests/recording/front_end.h"

namespace onramp {
namespace {

using corefoundation::Reference;
using corefoundation::toCFArray;
using corefoundation::toCFString;
using testing::ElementsAre;

Data bytesOf(std::string_view text) {
  const auto* const bytes = reinterpret_cast<const std::byte*>(text.data());
  return {bytes, bytes + text.size()};
}

Reference<CFNetServiceRef> makeService() {
  return Reference<CFNetServiceRef>(CFNetServiceCreate(nullptr, toCFString("local.").get(),
                                                       toCFString("_ipp._tcp.").get(),
                                                       toCFString("Büro").get(), 0));
}

struct Seen {
  NetServiceBrowserRef browser;
  NetServiceRef service;
  unsigned long flags = 0;
  std::int32_t code = 0;
  int events = 0;

  static void browsed(const NetServiceBrowserRef&, unsigned long flags,
                      const NetServiceRef& service, const NetServiceError& error, void* info) {
    auto& seen = *static_cast<Seen*>(info);
    seen.service = service;
    seen.flags = flags;
    seen.code = error.code;
    ++seen.events;
  }

  static void endBrowser(const NetServiceBrowserRef&, unsigned long, const NetServiceRef&,
                         const NetServiceError&, void* info) {
    static_cast<Seen*>(info)->browser.reset();
  }

  static void resolved(const NetServiceRef&, const NetServiceError& error, void* info) {
    auto& seen = *static_cast<Seen*>(info);
    seen.code = error.code;
    ++seen.events;
    seen.service.reset();
  }
};

// Passes an event to the client of the latest browser, as the framework does while the browser is
// scheduled.
void deliver(CFOptionFlags flags, CFTypeRef found, std::int32_t code) {
  standin::Browser& browser = *standin::Browser::last;
  ASSERT_TRUE(browser.isScheduled && browser.client);
  CFStreamError error = {0, code};
  browser.client(&browser, flags, found, &error, browser.info);
}

TEST(CFNetworkBrowser, ReportsAServiceWhenItIsFirstSeenAndWhenItsLastInstanceIsGone) {
  Seen seen;
  seen.browser = NetServiceBrowser::create(Seen::browsed, &seen);
  seen.browser->schedule();
  EXPECT_TRUE(seen.browser->searchForServices("local.", "_ipp._tcp."));
  EXPECT_EQ(standin::Browser::last->searched, "_ipp._tcp. in local.");

  const auto service = makeService();
  deliver(kNetServiceFlagMoreComing, service.get(), 0);
  ASSERT_TRUE(seen.service);
  EXPECT_EQ(seen.service->name(), "Büro");
  EXPECT_EQ(seen.service->type(), "_ipp._tcp.");
  EXPECT_EQ(seen.service->domain(), "local.");
  EXPECT_EQ(seen.flags, kNetServiceFlagMoreComing);

  const NetServiceRef first = seen.service;
  const auto again = makeService();
  deliver(0, again.get(), 0);
  deliver(kNetServiceFlagRemove, service.get(), 0);
  EXPECT_EQ(seen.events, 1);
  deliver(kNetServiceFlagRemove, again.get(), 0);
  EXPECT_EQ(seen.service, first);
  EXPECT_EQ(seen.flags, kNetServiceFlagRemove);
}

TEST(CFNetworkBrowser, ReportsItsServicesGoneAfterAnErrorAndSearchesAgain) {
  recording::FrontEnd& frontEnd = recording::FrontEnd::instance();
  Seen seen;
  seen.browser = NetServiceBrowser::create(Seen::browsed, &seen);
  seen.browser->schedule();
  EXPECT_TRUE(seen.browser->searchForServices("local.", "_ipp._tcp."));
  standin::Browser& native = *standin::Browser::last;
  const auto service = makeService();
  for (int round = 1; round <= 2; ++round) {
    deliver(0, service.get(), 0);
    deliver(0, nullptr, -72000);
    deliver(0, nullptr, -72005);        // stopping the search causes this error
    EXPECT_EQ(seen.events, 3 * round);  // in each round: found, gone, the first error
    EXPECT_EQ(seen.code, -72000);
    EXPECT_FALSE(native.isRunning);
    frontEnd.runTimers();
    EXPECT_TRUE(native.isRunning);
  }
  deliver(0, nullptr, -72000);
  seen.browser->stopSearch();
  frontEnd.runTimers();
  EXPECT_FALSE(native.isRunning);
}

TEST(CFNetworkBrowser, CanBeDestroyedByItsClientAndCanBeUnscheduled) {
  Seen seen;
  seen.browser = NetServiceBrowser::create(Seen::endBrowser, &seen);
  seen.browser->schedule();
  const auto kept = Reference<CFNetServiceBrowserRef>::retaining(standin::Browser::last);
  deliver(0, makeService().get(), 0);
  EXPECT_FALSE(seen.browser);
  EXPECT_EQ(kept.get()->client, nullptr);

  seen.browser = NetServiceBrowser::create(Seen::browsed, &seen);
  seen.browser->schedule();
  seen.browser->unschedule();
  EXPECT_FALSE(standin::Browser::last->isScheduled);
}

TEST(CFNetworkService, ResolvesToAddressesAndTxtDataAndCanBeReleasedByItsClient) {
  Seen seen;
  seen.service = NetService::create("local.", "_ipp._tcp.", "Büro", 0);
  auto* native = standin::Service::last;
  const auto kept = Reference<CFNetServiceRef>::retaining(native);
  seen.service->setClient(Seen::resolved, &seen);
  seen.service->schedule();
  EXPECT_TRUE(seen.service->resolveWithTimeout(std::chrono::seconds(5)));
  EXPECT_TRUE(native->isScheduled && native->isRunning);
  standin::Object addresses(standin::kArray), txt(standin::kData, std::string("\3a=1", 4));
  addresses.members = {new standin::Object(standin::kData, "one"),
                       new standin::Object(standin::kData, std::string("t\0o", 3))};
  native->addresses = &addresses;
  native->txt = &txt;
  NetServiceRef service = seen.service;
  CFStreamError error = {0, 0};
  native->client(native, &error, native->info);
  EXPECT_THAT(service->addressing(), ElementsAre(bytesOf("one"), bytesOf(std::string("t\0o", 3))));
  EXPECT_EQ(service->txtData(), bytesOf("\3a=1"));

  EXPECT_TRUE(service->resolveWithTimeout(std::chrono::seconds(5)));
  EXPECT_TRUE(service->addressing().empty() && !service->txtData())
      << "a new resolve drops the addresses and the TXT data of the previous one";
  seen.service = std::move(service);
  error.error = kNetServiceErrorTimeout;
  native->client(native, &error, native->info);
  EXPECT_EQ(seen.code, kNetServiceErrorTimeout);
  EXPECT_FALSE(native->isScheduled || native->isRunning || native->client);
}

TEST(CFNetworkService, RejectsStringsThatAreNotUTF8) {
  EXPECT_EQ(NetService::create("local.", "_ipp._tcp.", "B\xFCro", 0), nullptr);
  EXPECT_EQ(corefoundation::toCFArray({"a", "\xFF", "b"}).get()->members.size(), 2U);
}

TEST(SystemConfigurationStore, MakesKeysAndPatternsAndOmitsValuesOfUnknownTypes) {
  const DynamicStoreRef store = createDynamicStore("test");
  const auto key = createNetworkInterfaceEntityKey("State:", "en0", "IPv4");
  EXPECT_EQ(key, "State:/Network/Interface/en0/IPv4");
  EXPECT_EQ(copyMultiple(store, {}, {"a", "b"}), (Dictionary{{"patterns", Array{"a", "b"}}}));
  EXPECT_EQ(copyMultiple(nullptr, {*key}, {}), std::nullopt);
  EXPECT_EQ(lastDynamicStoreError(), kSCStatusNoStoreSession);
}

TEST(SystemConfigurationStore, KeepsItsCallbackAsLongAsItsSourceLives) {
  std::vector<std::string> changed;
  DynamicStoreRef store =
      createDynamicStore("test", [&](const std::vector<std::string>& keys) { changed = keys; });
  EXPECT_TRUE(setNotificationKeys(store, {"a"}, {}));
  DynamicStoreSourceRef source = createRunLoopSource(store, 0);
  addSourceToMainLoop(source);
  store.reset();
  standin::Store::last->change(toCFArray({"a", "b"}).get());
  EXPECT_THAT(changed, ElementsAre("a", "b"));
  source.reset();
  EXPECT_EQ(standin::Store::last, nullptr);
  EXPECT_EQ(createRunLoopSource(nullptr, 0), nullptr);
}

}  // namespace
}  // namespace onramp
