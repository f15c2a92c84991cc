#pragma once

#include <QObject>

class QWidget;

namespace onramp {

class ApplicationDelegate;

namespace qt {

/// Sees to what every window of the application does by itself: asking the delegate before it
/// closes, and its key equivalents.
class MainWindow final : public QObject {
  Q_OBJECT

 public:
  /// Watches `window`, which owns it. `delegate` outlives the window.
  MainWindow(ApplicationDelegate& delegate, QWidget* window);

  bool eventFilter(QObject* watched, QEvent* event) override;

 private:
  /// Clicks the first button in the window's order that takes `key` and can be clicked; whether
  /// there was one. Return goes to a button that has the focus instead.
  bool performKeyEquivalent(int key);

  QWidget* window_;
  ApplicationDelegate& delegate_;
};

/// Gives the application menu's standard items what they do. Each says in its property "action"
/// what that is, in the platform's words for it.
void connectStandardMenuItems(QWidget* window);

}  // namespace qt
}  // namespace onramp
