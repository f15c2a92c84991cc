#pragma once

#include <QBasicTimer>
#include <QProgressBar>

namespace onramp::qt {

/// A wheel of spokes that turns from start() to stop(). Assistive technology sees the turning
/// spinner as an indeterminate progress bar. If the spinner is turning when it appears, it takes
/// the keyboard focus, so that screen readers announce what the user is waiting for.
class Spinner final : public QProgressBar {
  Q_OBJECT

 public:
  using QProgressBar::QProgressBar;

  void start();
  void stop();

  /// Emitted by stop().
  Q_SIGNAL void stopped();

 protected:
  void showEvent(QShowEvent* event) override;
  void paintEvent(QPaintEvent* event) override;
  void timerEvent(QTimerEvent* event) override;

 private:
  QBasicTimer timer_;
  int turn_ = 0;  ///< the angle of the wheel, in spokes
};

}  // namespace onramp::qt
