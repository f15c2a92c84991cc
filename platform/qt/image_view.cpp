#include "platform/qt/image_view.h"

#include <QImageReader>
#include <QPainter>

#include "platform/qt/native.h"

namespace onramp {

namespace qt {

namespace {

// Images are drawn for displays of twice the usual density.
constexpr int kImageDensity = 2;

}  // namespace

void ImageViewWidget::setImage(const QString& path) {
  path_ = path;
  drawnFor_ = {};
  update();
}

void ImageViewWidget::setScaling(ImageScaling scaling) {
  scaling_ = scaling;
  drawnFor_ = {};
  update();
}

QPixmap ImageViewWidget::read() const {
  QImageReader reader(path_);
  const QSize viewPixels = (QSizeF(size()) * devicePixelRatioF()).toSize();
  QSize pixels = viewPixels;
  if (scaling_ == ImageScaling::kProportionallyDown) {
    pixels = (QSizeF(reader.size()) * devicePixelRatioF() / kImageDensity).toSize();
    if (pixels.width() > viewPixels.width() || pixels.height() > viewPixels.height()) {
      pixels.scale(viewPixels, Qt::KeepAspectRatio);
    }
  }
  if (!pixels.isEmpty()) reader.setScaledSize(pixels);
  QPixmap pixmap = QPixmap::fromImageReader(&reader);
  pixmap.setDevicePixelRatio(devicePixelRatioF());
  return pixmap;
}

void ImageViewWidget::paintEvent(QPaintEvent*) {
  if (path_.isEmpty()) return;
  if (drawnFor_ != size() || drawn_.devicePixelRatio() != devicePixelRatioF()) {
    drawn_ = read();
    drawnFor_ = size();
  }
  if (drawn_.isNull()) return;
  QRectF target(QPointF(), drawn_.deviceIndependentSize());
  target.moveCenter(QRectF(rect()).center());
  QPainter(this).drawPixmap(target.topLeft(), drawn_);
}

}  // namespace qt

void ImageView::setImage(const Image& image) const {
  if (auto* const view = qt::nativeOf<qt::ImageViewWidget>(*this)) {
    view->setImage(QString::fromStdString(image.path));
  }
}

void ImageView::setImageScaling(ImageScaling scaling) const {
  if (auto* const view = qt::nativeOf<qt::ImageViewWidget>(*this)) view->setScaling(scaling);
}

}  // namespace onramp
