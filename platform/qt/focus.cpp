#include "platform/qt/focus.h"

#include <QAbstractItemView>
#include <QWidget>

#include "platform/qt/native.h"

namespace onramp::qt {

void focusFirstControl(QWidget& page) {
  QWidget* first = nullptr;
  for (QWidget* control = page.nextInFocusChain(); control != &page;
       control = control->nextInFocusChain()) {
    if (!page.isAncestorOf(control) || !(control->focusPolicy() & Qt::TabFocus) ||
        !control->isVisibleTo(&page) || !control->isEnabled()) {
      continue;
    }
    const bool isList = qobject_cast<const QAbstractItemView*>(control) != nullptr;
    if (!first || isList) first = control;
    if (isList) break;
  }
  if (first) first->setFocus(Qt::OtherFocusReason);
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
