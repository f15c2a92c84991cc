#pragma once

class QWidget;

namespace onramp::qt {

/// Gives the keyboard focus to the page's list or else to its first control in tab order that can
/// take it.
void focusFirstControl(QWidget& page);

/// The same for the page that `window` shows, if it shows one.
void focusPage(const QWidget& window);

}  // namespace onramp::qt
