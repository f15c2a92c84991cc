#pragma once

class QWidget;

namespace onramp::qt {

/// Gives the keyboard focus to the first list on the page. If the page has no list, gives the focus
/// to the first control. The tab order decides which is first. Hidden and disabled controls, and
/// controls that the Tab key does not reach, do not count. Leaves the focus as it is if the page
/// has no control that counts.
void focusFirstControl(QWidget& page);

/// Calls focusFirstControl() for the page that `window` shows, if there is one.
void focusPage(const QWidget& window);

}  // namespace onramp::qt
