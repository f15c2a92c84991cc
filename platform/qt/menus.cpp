#include "platform/qt/menus.h"

#include <QAction>
#include <QApplication>
#include <QMenu>
#include <QMenuBar>
#include <QMessageBox>

#include "platform/bundle.h"
#include "platform/outlets.h"
#include "platform/qt/native.h"

namespace onramp {

namespace {

constexpr int kIconSize = 64;

std::string information(const std::string& key) {
  return Bundle::main().infoString(key).value_or("");
}

// The panel runs no nested event loop, so that a search for devices can end while the panel is
// open.
void showAboutPanel(QWidget* window, const QString& title) {
  const std::string version = Bundle::main().localizedString("Version %@", "Version %@", "About");
  auto* const panel = qt::makeChild<QMessageBox>(window);
  panel->setAttribute(Qt::WA_DeleteOnClose);
  panel->setWindowModality(Qt::NonModal);
  panel->setWindowTitle(title);
  panel->setTextFormat(Qt::PlainText);
  panel->setIconPixmap(QApplication::windowIcon().pixmap(kIconSize));
  panel->setText(QString::fromStdString(information("CFBundleName")));
  panel->setInformativeText(QString::fromStdString(version).replace(
                                QStringLiteral("%@"), QApplication::applicationVersion()) +
                            QLatin1Char('\n') +
                            QString::fromStdString(information("NSHumanReadableCopyright")));
  panel->addButton(qt::titleText(Bundle::main().localizedString("Close", "Close", "About")),
                   QMessageBox::AcceptRole);
  panel->show();
}

}  // namespace

namespace qt {

void nameMenuAfterProduct(const QMenuBar& bar) {
  const QString name = titleText(information("CFBundleName"));
  if (bar.actions().isEmpty() || name.isEmpty()) return;
  bar.actions().first()->setText(QLatin1Char('&') + name);
}

void connectStandardMenuItems(QWidget* window) {
  for (QAction* const item : window->findChildren<QAction*>()) {
    const QString action = item->property("action").toString();
    if (action == QLatin1String("orderFrontStandardAboutPanel:")) {
      QObject::connect(item, &QAction::triggered, window,
                       [window, item] { showAboutPanel(window, item->text()); });
    } else if (action == QLatin1String("hide:")) {
      // A desktop can restore a minimised window but not a hidden program.
      QObject::connect(item, &QAction::triggered, window, [window] { window->showMinimized(); });
    } else if (action == QLatin1String("unhideAllApplications:")) {
      QObject::connect(item, &QAction::triggered, window, [window] { window->showNormal(); });
    } else if (action == QLatin1String("hideOtherApplications:")) {
      item->setEnabled(false);  // only the desktop can hide other programs' windows
    } else if (action == QLatin1String("terminate:")) {
      QObject::connect(item, &QAction::triggered, window, &QWidget::close);
    }
  }
}

}  // namespace qt

using qt::nativeOf;

// A Menu refers to a QMenuBar or a QMenu. A MenuItem refers to a QAction in one of them.

MenuItem Menu::itemWithTitle(const std::string& title) const {
  const auto* const menu = nativeOf<QWidget>(*this);
  if (!menu) return {};
  const QString text = qt::titleText(title);
  for (QAction* const action : menu->actions()) {
    if (action->text() == text) return MenuItem(qt::toNative(action));
  }
  return {};
}

Menu MenuItem::submenu() const {
  const auto* const action = nativeOf<QAction>(*this);
  return Menu(qt::toNative(action ? action->menu() : nullptr));
}

void MenuItem::setTitle(const std::string& title) const {
  if (auto* const action = nativeOf<QAction>(*this)) action->setText(qt::titleText(title));
}

}  // namespace onramp
