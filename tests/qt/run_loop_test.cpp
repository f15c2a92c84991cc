#include "platform/run_loop.h"

#include <gmock/gmock.h>

#include <QCoreApplication>
#include <string>
#include <vector>

namespace onramp {
namespace {

TEST(RunLoop, TheEndOfAModalLoopGoesBeforeAllThatWaits) {
  std::vector<std::string> order;
  performOnMainThread([&] {
    order.emplace_back("takes long");
    abortModal();
  });
  performOnMainThread([&] { order.emplace_back("would take long"); });
  runModalForWindow({});
  order.emplace_back("ended");
  QCoreApplication::processEvents();
  EXPECT_THAT(order, testing::ElementsAre("takes long", "ended", "would take long"));
}

}  // namespace
}  // namespace onramp
