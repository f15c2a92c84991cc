#pragma once

#include <QObject>

class QWidget;

namespace onramp {

class ApplicationDelegate;

namespace qt {

/// Handles two kinds of events of a window. The delegate decides whether the window may close, and
/// some keys click buttons or open the menu.
class WindowEvents final : public QObject {
  Q_OBJECT

 public:
  /// Watches `window`, which owns this object. `delegate` must outlive the window.
  WindowEvents(ApplicationDelegate& delegate, QWidget* window);

  bool eventFilter(QObject* watched, QEvent* event) override;

 private:
  void close();

  /// Shows in the title bar what the wizard is waiting for, as long as it waits.
  void explainRefusal();

  /// Returns whether the key did anything.
  bool performKey(int key);

  /// Clicks the button that has the focus, or else the default button. Returns whether a button was
  /// clicked.
  bool performReturn();

  /// Selects the first menu of the menu bar, so that the arrow keys can be used from there. Returns
  /// whether there is a menu.
  bool openMenu();

  QWidget* window_;
  ApplicationDelegate& delegate_;
  bool isExplained_ = false;  ///< the title bar shows what the wizard is waiting for
};

}  // namespace qt
}  // namespace onramp
