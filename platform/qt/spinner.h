#pragma once

#include <QBasicTimer>
#include <QProgressBar>

namespace onramp::qt {

/// A wheel of spokes that turns while it is animated. To assistive programs it is what it is for: a
/// progress bar without a measure.
class Spinner final : public QProgressBar {
  Q_OBJECT

 public:
  using QProgressBar::QProgressBar;

  void start();
  void stop();

 protected:
  void paintEvent(QPaintEvent* event) override;
  void timerEvent(QTimerEvent* event) override;

 private:
  QBasicTimer timer_;
  int turn_ = 0;  ///< spokes that the wheel has turned
};

}  // namespace onramp::qt
