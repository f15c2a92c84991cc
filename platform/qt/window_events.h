#pragma once

#include <QObject>

class QWidget;

namespace onramp {

class ApplicationDelegate;

namespace qt {

/// Lets the delegate decide whether a window may close, and handles some keys. Escape clicks the
/// button whose key equivalent is "Escape". Return and Enter do what performReturn() does. F10 does
/// what openMenu() does.
class WindowEvents final : public QObject {
  Q_OBJECT

 public:
  /// Watches `window`, which owns this object. `delegate` must outlive the window.
  WindowEvents(ApplicationDelegate& delegate, QWidget* window);

  bool eventFilter(QObject* watched, QEvent* event) override;

 private:
  void close();

  /// Beeps. If a spinner is shown, the title bar says what the wizard is waiting for until the
  /// spinner stops.
  void explainRefusal();

  /// Returns whether the key did anything.
  bool performKey(int key);

  /// Clicks the button that has the focus. If no button has the focus, clicks the button whose key
  /// equivalent is "Return". Returns whether a button was clicked.
  bool performReturn();

  /// Selects the first menu of the menu bar, so that the arrow keys work in the menu bar. Returns
  /// whether there is a menu.
  bool openMenu();

  QWidget* window_;
  ApplicationDelegate& delegate_;
  bool isExplained_ = false;  ///< the title bar shows what the wizard is waiting for
};

}  // namespace qt
}  // namespace onramp
