#include "platform/qt/main_window.h"

#include <QAction>
#include <QApplication>
#include <QCloseEvent>
#include <QKeyEvent>
#include <QMessageBox>
#include <QPushButton>

#include "platform/application.h"
#include "platform/qt/loops.h"
#include "platform/qt/native.h"

namespace onramp::qt {

MainWindow::MainWindow(ApplicationDelegate& delegate, QWidget* window)
    : QObject(window), window_(window), delegate_(delegate) {
  window->installEventFilter(this);
}

bool MainWindow::eventFilter(QObject*, QEvent* event) {
  if (event->type() == QEvent::Close) {
    event->ignore();
    if (!delegate_.windowShouldClose(Window(toNative(window_)))) return true;
    window_->hide();
    if (delegate_.applicationShouldTerminateAfterLastWindowClosed()) terminateApplication();
    return true;
  }
  // A key comes here when the widget with the focus has no use for it.
  if (event->type() == QEvent::KeyPress) {
    return performKeyEquivalent(static_cast<QKeyEvent*>(event)->key());
  }
  return false;
}

bool MainWindow::performKeyEquivalent(int key) {
  QString name;
  if (key == Qt::Key_Escape) name = QStringLiteral("Escape");
  if (key == Qt::Key_Return || key == Qt::Key_Enter) name = QStringLiteral("Return");
  if (name.isEmpty()) return false;
  auto* const focused = qobject_cast<QPushButton*>(window_->focusWidget());
  if (focused && key != Qt::Key_Escape) {
    focused->click();
    return true;
  }
  for (QPushButton* const button : window_->findChildren<QPushButton*>()) {
    if (button->isVisible() && button->isEnabled() &&
        button->property("keyEquivalent").toString() == name) {
      button->click();
      return true;
    }
  }
  return false;
}

namespace {

// The panel has no loop of its own: a search's wait goes on and ends underneath it.
void showAboutPanel(QWidget* window) {
  auto* const panel = makeChild<QMessageBox>(window);
  panel->setAttribute(Qt::WA_DeleteOnClose);
  panel->setWindowModality(Qt::NonModal);
  panel->setWindowTitle(window->windowTitle());
  panel->setText(window->windowTitle() + QLatin1Char('\n') + QApplication::applicationVersion());
  panel->show();
}

}  // namespace

void connectStandardMenuItems(QWidget* window) {
  for (QAction* const item : window->findChildren<QAction*>()) {
    const QString action = item->property("action").toString();
    if (action == QLatin1String("orderFrontStandardAboutPanel:")) {
      QObject::connect(item, &QAction::triggered, window, [window] { showAboutPanel(window); });
    } else if (action == QLatin1String("hide:")) {
      // A desktop has no way back to a hidden program, but to a minimised window it has.
      QObject::connect(item, &QAction::triggered, window, [window] { window->showMinimized(); });
    } else if (action == QLatin1String("unhideAllApplications:")) {
      QObject::connect(item, &QAction::triggered, window, [window] { window->showNormal(); });
    } else if (action == QLatin1String("hideOtherApplications:")) {
      item->setEnabled(false);  // other programs' windows are the desktop's alone
    } else if (action == QLatin1String("terminate:")) {
      QObject::connect(item, &QAction::triggered, window, [] {
        if (!isModal()) terminateApplication();
      });
    }
  }
}

}  // namespace onramp::qt
