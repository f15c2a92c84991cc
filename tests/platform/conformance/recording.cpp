#include <gmock/gmock.h>

#include "tests/platform/conformance/front_end.h"
#include "tests/recording/front_end.h"

// Only the tests named MainLoop run on the recording front end. Its timers and alerts do nothing
// until a test acts as the clock and the user, so the other tests do not apply.

namespace onramp::conformance {

const Window& window() {
  static const Window none;
  return none;
}

void clickSoon(const std::string&) {}

}  // namespace onramp::conformance

int main(int argc, char** argv) {
  testing::InitGoogleMock(&argc, argv);
  GTEST_FLAG_SET(filter, "MainLoop.*");
  onramp::recording::FrontEnd::instance().reset();
  return RUN_ALL_TESTS();
}
