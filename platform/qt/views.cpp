#include <QLabel>
#include <QVBoxLayout>
#include <QWidget>

#include "platform/outlets.h"
#include "platform/qt/focus.h"
#include "platform/qt/native.h"

namespace onramp {

namespace {

using qt::nativeOf;

}  // namespace

void View::setHidden(bool hidden) const {
  if (auto* const view = nativeOf<QWidget>(*this)) view->setHidden(hidden);
}

View View::firstSubview() const {
  auto* const view = nativeOf<QWidget>(*this);
  return View(
      qt::toNative(view ? view->findChild<QWidget*>({}, Qt::FindDirectChildrenOnly) : nullptr));
}

void View::addSubview(const View& inner) const {
  auto* const view = nativeOf<QWidget>(*this);
  auto* const added = nativeOf<QWidget>(inner);
  if (!view || !added) return;
  if (!view->layout()) qt::makeChild<QVBoxLayout>(view)->setContentsMargins(0, 0, 0, 0);
  view->layout()->addWidget(added);
  added->show();
  qt::focusFirstControl(*added);
}

void View::removeFromSuperview() const {
  if (auto* const view = nativeOf<QWidget>(*this)) view->setParent(nullptr);
}

void Control::setEnabled(bool enabled) const {
  if (auto* const control = nativeOf<QWidget>(*this)) control->setEnabled(enabled);
}

void TextField::setStringValue(const std::string& text) const {
  if (auto* const label = nativeOf<QLabel>(*this)) {
    label->setTextFormat(Qt::PlainText);
    label->setText(QString::fromStdString(text));
    // Qt uses a label's text as the accessible name of its buddy only for some kinds of control.
    if (label->buddy()) label->buddy()->setAccessibleName(label->text());
  }
}

}  // namespace onramp
