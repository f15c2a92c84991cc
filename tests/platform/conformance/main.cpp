#include <gmock/gmock.h>

#include <cstdio>
#include <cstdlib>
#include <memory>

#include "platform/application.h"
#include "platform/run_loop.h"
#include "tests/platform/conformance/front_end.h"

namespace onramp {

namespace conformance {

namespace {

Window mainWindow;

}  // namespace

const Window& window() {
  return mainWindow;
}

}  // namespace conformance

namespace {

/// Runs all tests inside the application's main loop, once the application has launched.
class Tests : public ApplicationDelegate {
 public:
  void performAction(std::string_view) override {}
  void setOutlets(const Interface& mainInterface) override {
    conformance::mainWindow = mainInterface.outlet<Window>("window");
  }
  void awakeFromNib() override {}
  void applicationWillFinishLaunching() override {}
  void applicationDidFinishLaunching() override {
    // A timer starts the tests, because on some systems the application counts as running only
    // after this function has returned.
    scheduleTimer(std::chrono::milliseconds(0), [] {
      const int status = RUN_ALL_TESTS();
      std::fflush(nullptr);
      std::_Exit(status);
    });
  }
  bool applicationShouldTerminateAfterLastWindowClosed() override { return false; }
  bool windowShouldClose(const Window&) override { return false; }
};

}  // namespace
}  // namespace onramp

int main(int argc, char** argv) {
  testing::InitGoogleMock(&argc, argv);
  return onramp::runApplication(argc, argv, "MainMenu",
                                [] { return std::make_unique<onramp::Tests>(); });
}
