#include "base/notification_center.h"

#include <gtest/gtest.h>

namespace onramp {
namespace {

class Center : public testing::Test {
 protected:
  // Observes `name` as `observer`, which is identified by its address, and then does `more`.
  void observe(
      const char& observer, const std::string& name, const std::function<void()>& more = [] {}) {
    center.addObserver(&observer, name, [this, &observer, more](const Notification& notification) {
      log += std::string{observer} + ':' + notification.name + ' ';
      more();
    });
  }

  NotificationCenter center;
  std::string log;
  const char a = 'a', b = 'b', c = 'c';
};

TEST_F(Center, CallsTheObserversOfANameInOrder) {
  observe(b, "x");
  observe(a, "x");
  observe(c, "y");
  observe(b, "x");
  center.post({"x", nullptr, {}});
  EXPECT_EQ(log, "b:x a:x b:x ");
  center.removeObserver(&b);
  center.post({"x", nullptr, {}});
  center.post({"z", nullptr, {}});
  EXPECT_EQ(log, "b:x a:x b:x a:x ");
}

TEST_F(Center, HandlersMayRemoveAddAndPost) {
  observe(a, "x", [&] {
    center.removeObserver(&a);
    center.removeObserver(&b);
    observe(c, "x");
    center.post({"y", nullptr, {}});
  });
  observe(b, "x");
  observe(b, "y");
  observe(c, "y");
  observe(c, "x");
  center.post({"x", nullptr, {}});
  EXPECT_EQ(log, "a:x c:y c:x ");
  center.post({"x", nullptr, {}});
  EXPECT_EQ(log, "a:x c:y c:x c:x c:x ") << "the observer added meanwhile is called from now on";
}

TEST_F(Center, HandsOnWhatWasPosted) {
  int number = 0;
  const void* object = nullptr;
  center.addObserver(this, "x", [&](const Notification& notification) {
    object = notification.object;
    number = std::any_cast<int>(notification.userInfo.at("number"));
  });
  center.post({"x", &a, {{"number", 5}}});
  EXPECT_EQ(object, &a);
  EXPECT_EQ(number, 5);
}

}  // namespace
}  // namespace onramp
