#pragma once

class QMenuBar;
class QWidget;

namespace onramp::qt {

/// Makes the standard items of the application menu work. The property "action" of each item names
/// what the item does by the name of AppKit's method, such as "terminate:".
void connectStandardMenuItems(QWidget* window);

/// Gives the application menu the product's name from the bundle's information dictionary. Alt and
/// the first letter of the name open the menu.
void nameMenuAfterProduct(const QMenuBar& bar);

}  // namespace onramp::qt
