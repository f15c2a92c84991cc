#include <QApplication>
#include <QPushButton>

#include "platform/run_loop.h"
#include "tests/platform/conformance/front_end.h"

namespace onramp::conformance {

void clickSoon(const std::string& title) {
  scheduleTimer(std::chrono::milliseconds(10), [title] {
    for (QWidget* const widget : QApplication::allWidgets()) {
      auto* const button = qobject_cast<QPushButton*>(widget);
      if (button && button->isVisible() && button->text().toStdString() == title) {
        button->click();
        return;
      }
    }
    clickSoon(title);
  });
}

}  // namespace onramp::conformance
