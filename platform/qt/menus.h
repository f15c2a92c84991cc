#pragma once

class QMenuBar;
class QWidget;

namespace onramp::qt {

/// Connects the standard menu items of `window` to what they do on a desktop: "About" shows the
/// product's name, version and copyright notice, "Hide" minimises the window, "Show All" restores
/// it, and "Quit" closes it. Disables "Hide Others", because only the desktop can hide other
/// programs. An item's property "action" names the AppKit method that carries out the item's
/// command on macOS, such as "terminate:". An unknown name has no effect.
void connectStandardMenuItems(QWidget* window);

/// Gives the application menu the product's name from the bundle's information dictionary. Alt and
/// the first letter of the name open the menu. Does nothing when there is no menu or no name.
void nameMenuAfterProduct(const QMenuBar& bar);

}  // namespace onramp::qt
