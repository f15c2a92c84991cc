#include <memory>

#include "app/OnrampOSXAppDelegate.h"
#include "platform/application.h"

int main(int argc, char** argv) {
  return onramp::runApplication(argc, argv, "MainMenu",
                                [] { return std::make_unique<onramp::OnrampOSXAppDelegate>(); });
}
