// Tests what happens when the system refuses to create a process, a thread or a descriptor.

#include <gtest/gtest.h>
#include <signal.h>
#include <sys/un.h>

#include <cstdlib>
#include <filesystem>
#include <functional>

#include "platform/child_process.h"
#include "platform/datagram_socket.h"
#include "platform/dynamic_store.h"
#include "platform/interruption.h"
#include "platform/net_service.h"
#include "platform/workspace.h"
#include "tests/faults/failures.h"
#include "tests/platform/in_process.h"
#include "tests/recording/temporary_folder.h"

namespace onramp {
namespace {

bool search() {
  const auto browser = NetServiceBrowser::create(
      [](const auto&, unsigned long, const auto&, const auto&, void*) {}, nullptr);
  return browser->searchForServices("local.", "_ipp._tcp.");
}

bool resolve() {
  const auto service = NetService::create("local.", "_ipp._tcp.", "Kestrel", 0);
  EXPECT_FALSE(service->resolveWithTimeout(std::chrono::milliseconds(1)))
      << "no such service exists";
  service->setClient([](const auto&, const auto&, void*) {}, nullptr);
  return service->resolveWithTimeout(std::chrono::seconds(1));
}

TEST(Scarcity, MakesAFunctionFailAndDoesNoOtherHarm) {
  const TemporaryFolder folder;
  const std::string opener = folder.holding("xdg-open", "#!/bin/sh\n");
  std::filesystem::permissions(opener, std::filesystem::perms::all);
  setenv("PATH", (folder / "").c_str(), 1);
  setenv("DBUS_SYSTEM_BUS_ADDRESS", ("unix:path=" + folder / "bus").c_str(), 1);
  const std::pair<const char*, std::function<bool()>> functions[] = {
      {"search", search},
      {"resolve", resolve},
      {"createDynamicStore", [] { return createDynamicStore("test") != nullptr; }},
      {"DatagramSocket::open", [] { return DatagramSocket::open().has_value(); }},
      {"runAndWait", [&] { return runAndWait(opener, {}) == 0; }},
      {"openFile", [] { return openFile("/package.pkg"); }}};
  for (const auto& function : functions) {
    SCOPED_TRACE(function.first);
    bool succeeded = false;
    faults::failEveryCall(
        {EMFILE, EAGAIN}, [&] { succeeded = function.second(); },
        [&](const std::string& failed, const faults::Failure&) {
          EXPECT_TRUE(succeeded || !failed.empty());
        });
  }
}

// The main loop keeps the descriptors of the store's source open. failEveryCall() would report
// them, so this test does not use that function.
TEST(Scarcity, LeavesAStoreWithoutNotifications) {
  const std::vector<std::string> keys{"State:/Network/Global/IPv4"};
  const DynamicStoreRef store = createDynamicStore("test");
  const DynamicStoreSourceRef source = createRunLoopSource(store, 0);
  EXPECT_TRUE(setNotificationKeys(store, keys, {}));
  faults::begin({1, EAGAIN});
  addSourceToMainLoop(source);
  EXPECT_EQ(faults::end().front(), "pthread_create");
  bool hasFailed = true;
  for (std::size_t number = 1; hasFailed; ++number) {
    faults::begin({number, EAGAIN});
    const bool isWatched = setNotificationKeys(store, keys, {});
    hasFailed = faults::end().size() >= number;
    EXPECT_NE(isWatched, hasFailed) << number;
  }
}

TEST(Scarcity, LetsASignalEndAProgramThatCannotWaitForIt) {
  const int status = inProcess([] {
    faults::begin({1, EAGAIN, true});
    onInterruption([] {});
    raise(SIGTERM);
    return true;
  });
  EXPECT_TRUE(WIFSIGNALED(status) && WTERMSIG(status) == SIGTERM);
}

}  // namespace
}  // namespace onramp
