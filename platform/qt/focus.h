#pragma once

class QWidget;

namespace onramp::qt {

/// Gives the keyboard focus to the first list on the page or, if the page has no list, to the first
/// control in the tab order. Ignores controls that are hidden, are disabled, or cannot be reached
/// with the Tab key. Does nothing if no control remains.
void focusFirstControl(QWidget& page);

/// Calls focusFirstControl() for the page that `window` shows, if it shows one.
void focusPage(const QWidget& window);

}  // namespace onramp::qt
