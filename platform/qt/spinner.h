#pragma once

#include <QBasicTimer>
#include <QProgressBar>

namespace onramp::qt {

/// A wheel of spokes that turns from start() to stop(). To assistive programs, the turning spinner
/// is a progress bar that does not show how much is done. If the spinner is turning when it
/// appears, it takes the keyboard focus, so that these programs read out what the user is waiting
/// for.
class Spinner final : public QProgressBar {
  Q_OBJECT

 public:
  using QProgressBar::QProgressBar;

  /// Start and stop the turning.
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
  int turn_ = 0;  ///< by how many spokes the wheel has turned
};

}  // namespace onramp::qt
