#include "platform/qt/focus.h"

#include <QWidget>

#include "platform/qt/native.h"

namespace onramp::qt {

void focusFirstControl(QWidget& page) {
  for (QWidget* control = page.nextInFocusChain(); control != &page;
       control = control->nextInFocusChain()) {
    if (page.isAncestorOf(control) && (control->focusPolicy() & Qt::TabFocus) &&
        control->isVisibleTo(&page) && control->isEnabled()) {
      control->setFocus(Qt::OtherFocusReason);
      return;
    }
  }
}

void focusPage(const QWidget& window) {
  for (QWidget* const widget : window.findChildren<QWidget*>()) {
    if (!widget->property(kViewClass).isNull() && widget->isVisible()) {
      focusFirstControl(*widget);
      return;
    }
  }
}

}  // namespace onramp::qt
