#include <QAction>
#include <QMenu>
#include <QMenuBar>

#include "platform/outlets.h"
#include "platform/qt/native.h"

namespace onramp {

using qt::nativeOf;

// A menu is a QMenuBar or a QMenu, an item one of its actions.

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
