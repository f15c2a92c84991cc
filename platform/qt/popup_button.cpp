#include <QAction>
#include <QMenu>
#include <QToolButton>
#include <memory>
#include <utility>

#include "platform/outlets.h"
#include "platform/qt/native.h"

namespace onramp {

using qt::nativeOf;

// Item 0 is the button itself. The other items are the actions of its menu.

std::size_t PopUpButton::numberOfItems() const {
  const auto* const button = nativeOf<QToolButton>(*this);
  if (!button) return 0;
  return 1 + (button->menu() ? static_cast<std::size_t>(button->menu()->actions().size()) : 0);
}

void PopUpButton::removeItem(std::size_t index) const {
  auto* const button = nativeOf<QToolButton>(*this);
  if (!button || index < 1 || index >= numberOfItems()) return;
  const std::unique_ptr<QAction> item(
      button->menu()->actions().at(static_cast<qsizetype>(index) - 1));
}

void PopUpButton::addItem(const std::string& title, std::function<void()> action) const {
  auto* const button = nativeOf<QToolButton>(*this);
  if (!button) return;
  if (!button->menu()) button->setMenu(qt::makeChild<QMenu>(button));
  const QAction* const item = button->menu()->addAction(qt::titleText(title));
  // Runs the action after the menu has closed, because an action can block for seconds.
  QObject::connect(item, &QAction::triggered, button, std::move(action), Qt::QueuedConnection);
}

}  // namespace onramp
