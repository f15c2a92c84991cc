#include <gmock/gmock.h>

#include <chrono>
#include <cstdlib>
#include <string>
#include <thread>
#include <vector>

#include "platform/alert.h"
#include "platform/application.h"
#include "platform/run_loop.h"
#include "tests/platform/conformance/front_end.h"

namespace onramp {
namespace {

using conformance::clickSoon;
using conformance::window;
using testing::ElementsAre;
using namespace std::literals;

class MainLoop : public testing::Test {
 protected:
  [[nodiscard]] std::function<void()> noting(const char* word) {
    return [this, word] {
      EXPECT_EQ(std::this_thread::get_id(), mainThread);
      log.emplace_back(word);
    };
  }

  std::vector<std::string> log;
  const std::thread::id mainThread = std::this_thread::get_id();
};

TEST_F(MainLoop, PerformsActionsFromAnyThreadInOrderWhileAModalLoopRuns) {
  std::thread poster([&] {
    performOnMainThread(noting("first"));
    performOnMainThread(noting("second"));
    performOnMainThread([&] {
      performOnMainThread([&] {
        noting("posted by an action")();
        abortModal();
      });
      noting("third")();
    });
  });
  poster.join();
  noting("before the loop")();
  runModalForWindow(window());
  EXPECT_THAT(log,
              ElementsAre("before the loop", "first", "second", "third", "posted by an action"));
}

TEST_F(MainLoop, EndsAModalLoopBeforeTheWaitingActionsRun) {
  performOnMainThread([&] {
    noting("takes long")();
    std::thread(abortModal).join();
  });
  performOnMainThread([&] {
    noting("would take long")();
    abortModal();
  });
  runModalForWindow(window());
  noting("ended")();
  runModalForWindow(window());
  EXPECT_THAT(log, ElementsAre("takes long", "ended", "would take long"));
}

using Timers = MainLoop;

TEST_F(Timers, RunInTheOrderOfTheirTimesAndNotTooSoonWhileAModalLoopRuns) {
  const auto start = std::chrono::steady_clock::now();
  scheduleTimer(300ms, [] { abortModal(); });
  scheduleTimer(200ms, noting("third"));
  scheduleTimer(0ms, [&] {
    scheduleTimer(100ms, noting("second"));
    noting("first")();
  });
  noting("before the loop")();
  runModalForWindow(window());
  EXPECT_GE(std::chrono::steady_clock::now() - start, 299ms);
  EXPECT_THAT(log, ElementsAre("before the loop", "first", "second", "third"));
}

using Alert = MainLoop;

TEST_F(Alert, BlocksUntilItIsDismissedAndLetsActionsRun) {
  performOnMainThread(noting("action"));
  clickSoon("Dismiss");
  runCriticalAlert("Message", "Information", "Dismiss");
  EXPECT_THAT(log, ElementsAre("action"));
}

TEST_F(Alert, SheetReturnsAtOnceAndReportsTheButton) {
  for (const auto& [button, expected] :
       {std::pair("Standard", kAlertDefaultReturn), std::pair("Other", kAlertOtherReturn)}) {
    int returned = 0;
    beginAlertSheet({"Title", "Message", "Standard", "Other"}, window(), [&](int code) {
      returned = code;
      abortModal();
    });
    EXPECT_EQ(returned, 0);
    clickSoon(button);
    runModalForWindow(window());
    EXPECT_EQ(returned, expected) << button;
  }
}

constexpr int kEndedAsPromised = 7;

TEST(Termination, EndsModalLoopsAndInterruptsSleepsAndThenRunsNothing) {
  GTEST_FLAG_SET(death_test_style, "threadsafe");
  const auto terminateInAModalLoop = [] {
    static bool hasRun = false;
    static bool slept = true;
    static std::thread sleeper([] { slept = sleepOffMainThread(1h) || sleepOffMainThread(1h); });
    // On some systems terminateApplication() exits, so the result is checked at exit.
    std::atexit([] {
      sleeper.join();
      std::_Exit(slept || hasRun ? 1 : kEndedAsPromised);
    });
    scheduleTimer(0ms, [] {
      terminateApplication();
      performOnMainThread([] { hasRun = true; });
    });
    scheduleTimer(10ms, [] { hasRun = true; });
    runModalForWindow(window());
    runModalForWindow(window());
    std::exit(0);
  };
  EXPECT_EXIT(terminateInAModalLoop(), testing::ExitedWithCode(kEndedAsPromised), "");
}

}  // namespace
}  // namespace onramp
