#pragma once

class QWidget;

namespace onramp::qt {

/// Gives the keyboard focus to the first list on the page. If the page has no list, gives the focus
/// to the first control in tab order that accepts the focus. Leaves the focus as it is if there is
/// no such control.
void focusFirstControl(QWidget& page);

/// Calls focusFirstControl() for the page that `window` shows, if there is one.
void focusPage(const QWidget& window);

}  // namespace onramp::qt
