#include <memory>

#include "app/OnrampOSXAppDelegate.h"
#include "platform/application.h"
#include "platform/failed_writes.h"

int main(int argc, char** argv) {
  onramp::surviveFailedWrites();
  return onramp::runApplication(argc, argv, "MainMenu",
                                [] { return std::make_unique<onramp::OnrampOSXAppDelegate>(); });
}
