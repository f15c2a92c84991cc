#pragma once

#include <QObject>

class QWidget;

namespace onramp {

class ApplicationDelegate;

namespace qt {

/// Gives a window what the delegate and the keyboard expect of it: the delegate's veto on closing,
/// and key equivalents.
class WindowEvents final : public QObject {
  Q_OBJECT

 public:
  /// Watches `window`, which owns this object. `delegate` outlives the window.
  WindowEvents(ApplicationDelegate& delegate, QWidget* window);

  bool eventFilter(QObject* watched, QEvent* event) override;

 private:
  void close();

  /// Says in the title bar what the window waits for, until the wait is over.
  void explainRefusal();

  /// Returns whether the key did anything.
  bool performKey(int key);

  /// Clicks the button with the focus or else the default one.
  bool performReturn();

  /// Selects the first menu of the menu bar, from where the arrow keys lead on.
  bool openMenu();

  QWidget* window_;
  ApplicationDelegate& delegate_;
  bool isExplained_ = false;  ///< the title bar says what the window waits for
};

}  // namespace qt
}  // namespace onramp
