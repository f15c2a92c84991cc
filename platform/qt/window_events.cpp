#include "platform/qt/window_events.h"

#include <QApplication>
#include <QKeyEvent>
#include <QLabel>
#include <QMenuBar>
#include <QPushButton>

#include "platform/application.h"
#include "platform/qt/native.h"
#include "platform/qt/spinner.h"

namespace onramp::qt {

namespace {

bool clickFirst(const QWidget& window, const QString& keyEquivalent) {
  for (QPushButton* const button : window.findChildren<QPushButton*>()) {
    if (button->isVisible() && button->isEnabled() &&
        button->property("keyEquivalent").toString() == keyEquivalent) {
      button->click();
      return true;
    }
  }
  return false;
}

// Returns the visible spinner, or null if there is none.
const Spinner* visibleSpinner(const QWidget& window) {
  for (const Spinner* const spinner : window.findChildren<Spinner*>()) {
    if (spinner->isVisible()) return spinner;
  }
  return nullptr;
}

QString textBeside(const Spinner& spinner, const QWidget& window) {
  for (const QLabel* const label : window.findChildren<QLabel*>()) {
    if (label->buddy() == &spinner) return label->text();
  }
  return {};
}

}  // namespace

WindowEvents::WindowEvents(ApplicationDelegate& delegate, QWidget* window)
    : QObject(window), window_(window), delegate_(delegate) {
  window->installEventFilter(this);
}

bool WindowEvents::eventFilter(QObject*, QEvent* event) {
  if (event->type() == QEvent::Close) {
    event->ignore();
    close();
    return true;
  }
  // The window receives a key only if the widget with the focus has not used it.
  if (event->type() == QEvent::KeyPress) return performKey(static_cast<QKeyEvent*>(event)->key());
  return false;
}

void WindowEvents::close() {
  if (!delegate_.windowShouldClose(Window(toNative(window_)))) {
    explainRefusal();
    return;
  }
  window_->hide();
  if (delegate_.applicationShouldTerminateAfterLastWindowClosed()) terminateApplication();
}

void WindowEvents::explainRefusal() {
  QApplication::beep();
  const Spinner* const spinner = visibleSpinner(*window_);
  if (!spinner || isExplained_) return;
  isExplained_ = true;
  const QString title = window_->windowTitle();
  window_->setWindowTitle(QStringLiteral("%1 – %2").arg(title, textBeside(*spinner, *window_)));
  connect(
      spinner, &Spinner::stopped, this,
      [this, title] {
        window_->setWindowTitle(title);
        isExplained_ = false;
      },
      Qt::SingleShotConnection);
}

bool WindowEvents::performKey(int key) {
  switch (key) {
    case Qt::Key_Escape:
      return clickFirst(*window_, QStringLiteral("Escape"));
    case Qt::Key_Return:
    case Qt::Key_Enter:
      return performReturn();
    case Qt::Key_F10:
      return openMenu();
    default:
      return false;
  }
}

bool WindowEvents::performReturn() {
  if (auto* const focused = qobject_cast<QPushButton*>(window_->focusWidget())) {
    focused->click();
    return true;
  }
  return clickFirst(*window_, QStringLiteral("Return"));
}

bool WindowEvents::openMenu() {
  auto* const bar = window_->findChild<QMenuBar*>();
  if (!bar || bar->actions().isEmpty()) return false;
  bar->setActiveAction(bar->actions().first());
  return true;
}

}  // namespace onramp::qt
