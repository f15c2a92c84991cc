#pragma once

class QMenuBar;
class QWidget;

namespace onramp::qt {

/// Makes the standard menu items of `window` work: "About" shows the product's name, version and
/// copyright notice, "Hide" minimises the window, "Show All" restores it, and "Quit" closes it.
/// Disables "Hide Others", because only the desktop can hide other programs. Recognises an item by
/// its property "action", which is the name of an AppKit method, such as "terminate:".
void connectStandardMenuItems(QWidget* window);

/// Sets the title of the first menu to the product's name from the bundle's information dictionary.
/// Alt and the first letter of the name open the menu. Does nothing if there is no menu or no name.
void nameMenuAfterProduct(const QMenuBar& bar);

}  // namespace onramp::qt
