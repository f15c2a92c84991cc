#pragma once

class QWidget;

namespace onramp::qt {

/// Gives the keyboard focus to the first list on the page. If the page has no list, its first
/// control in tab order that accepts the focus gets it.
void focusFirstControl(QWidget& page);

/// Calls focusFirstControl() for the page that `window` shows, if there is one.
void focusPage(const QWidget& window);

}  // namespace onramp::qt
