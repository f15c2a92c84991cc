#include "base/notification_center.h"

#include <gtest/gtest.h>

namespace onramp {
namespace {

TEST(NotificationCenter, CallsObserversInOrderEvenWhenHandlersAddAndRemoveThem) {
  NotificationCenter center;
  std::string log;
  const char a = 'a', b = 'b', c = 'c';  // observers, identified by their addresses
  const auto observe = [&](const char& observer, const char* name) {
    center.addObserver(&observer, name, [&](const Notification& notification) {
      log += std::string{observer} + notification.name + ' ';
    });
  };
  center.addObserver(&a, "x", [&](const Notification& notification) {
    log += std::any_cast<std::string>(notification.userInfo.at("text")) + "( ";
    center.removeObserver(&a);
    center.removeObserver(&b);
    observe(c, "x");
    center.post({"y", nullptr, {}});
    log += ") ";
  });
  observe(b, "x");
  observe(b, "y");
  observe(c, "y");
  observe(c, "x");
  center.post({"x", nullptr, {{"text", std::string("first")}}});
  EXPECT_EQ(log, "first( cy ) cx ");
  center.post({"x", nullptr, {}});
  EXPECT_EQ(log, "first( cy ) cx cx cx ")
      << "a handler added during a notification gets later ones";
}

}  // namespace
}  // namespace onramp
