#pragma once

#include <QObject>

class QWidget;

namespace onramp {

class ApplicationDelegate;

namespace qt {

/// Lets the delegate decide whether a window may close and whether the application then terminates.
/// Also handles some keys. Escape clicks the first visible, enabled button whose key equivalent is
/// "Escape". Return and Enter call performReturn(), and F10 calls openMenu().
class WindowEvents final : public QObject {
  Q_OBJECT

 public:
  /// Watches `window`, which owns this object. `delegate` must outlive the window.
  WindowEvents(ApplicationDelegate& delegate, QWidget* window);

  bool eventFilter(QObject* watched, QEvent* event) override;

 private:
  void close();

  /// Beeps. If a spinner is visible, also adds the text beside it to the window's title until the
  /// spinner stops.
  void explainRefusal();

  /// Returns whether the key did anything.
  bool performKey(int key);

  /// Clicks the push button that has the focus. If no push button has the focus, clicks the first
  /// visible, enabled one whose key equivalent is "Return". Returns whether it clicked a button.
  bool performReturn();

  /// Selects the first menu of the menu bar, so that the arrow keys work there. Returns whether
  /// there is a menu.
  bool openMenu();

  QWidget* window_;
  ApplicationDelegate& delegate_;
  bool isExplained_ = false;  ///< the window's title contains the text beside the spinner
};

}  // namespace qt
}  // namespace onramp
