#include "platform/qt/spinner.h"

#include <QPainter>
#include <QTimerEvent>
#include <algorithm>

#include "platform/outlets.h"
#include "platform/qt/native.h"

namespace onramp {

namespace qt {

namespace {

constexpr int kSpokes = 12;
constexpr int kMillisecondsPerSpoke = 80;

}  // namespace

void Spinner::start() {
  setRange(0, 0);
  timer_.start(kMillisecondsPerSpoke, this);
}

void Spinner::stop() {
  timer_.stop();
  setRange(0, 1);
  Q_EMIT stopped();
}

void Spinner::showEvent(QShowEvent* event) {
  QProgressBar::showEvent(event);
  if (timer_.isActive()) setFocus(Qt::OtherFocusReason);
}

void Spinner::timerEvent(QTimerEvent* event) {
  if (event->timerId() != timer_.timerId()) {
    QProgressBar::timerEvent(event);
    return;
  }
  turn_ = (turn_ + 1) % kSpokes;
  update();
}

void Spinner::paintEvent(QPaintEvent*) {
  QPainter painter(this);
  painter.setRenderHint(QPainter::Antialiasing);
  painter.translate(QRectF(rect()).center());
  const double radius = std::min(width(), height()) / 2.0 - 1;
  painter.rotate(turn_ * 360.0 / kSpokes);
  QColor color = palette().color(QPalette::WindowText);
  for (int spoke = 0; spoke < kSpokes; ++spoke) {
    // The spokes become more opaque from the first one to the last.
    color.setAlphaF(0.15F + 0.7F * static_cast<float>(spoke) / kSpokes);
    painter.setPen(QPen(color, radius / 5, Qt::SolidLine, Qt::RoundCap));
    painter.drawLine(QPointF(0, -radius * 0.5), QPointF(0, -radius * 0.9));
    painter.rotate(360.0 / kSpokes);
  }
}

}  // namespace qt

void ProgressIndicator::startAnimation() const {
  if (auto* const spinner = qt::nativeOf<qt::Spinner>(*this)) spinner->start();
}

void ProgressIndicator::stopAnimation() const {
  if (auto* const spinner = qt::nativeOf<qt::Spinner>(*this)) spinner->stop();
}

}  // namespace onramp
