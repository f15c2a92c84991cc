#pragma once

class QMenuBar;
class QWidget;

namespace onramp::qt {

/// Makes the standard items of the application menu work. The property "action" of each names what
/// it does, in AppKit's words.
void connectStandardMenuItems(QWidget* window);

/// Gives the application menu the product's name from the bundle's information dictionary. Alt with
/// its first letter opens it.
void nameMenuAfterProduct(const QMenuBar& bar);

}  // namespace onramp::qt
