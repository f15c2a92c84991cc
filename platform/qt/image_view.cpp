#include "platform/qt/image_view.h"

#include <QPainter>

#include "platform/qt/native.h"

namespace onramp {

namespace qt {

namespace {

// The image files are made for displays with twice the usual pixel density.
constexpr int kImageDensity = 2;

}  // namespace

void ImageViewWidget::setImage(const QString& path) {
  path_ = path;
  pixmap_.reset();
  update();
}

void ImageViewWidget::setScaling(ImageScaling scaling) {
  scaling_ = scaling;
  update();
}

QRectF ImageViewWidget::target() const {
  if (scaling_ == ImageScaling::kAxesIndependently) return rect();
  QSizeF size = QSizeF(pixmap_->size()) / kImageDensity;
  if (size.width() > width() || size.height() > height()) {
    size.scale(this->size(), Qt::KeepAspectRatio);
  }
  QRectF target(QPointF(), size);
  target.moveCenter(QRectF(rect()).center());
  return target;
}

bool ImageViewWidget::isOutOfPlace() const {
  const auto lightness = [this](QPalette::ColorRole role) {
    return palette().color(role).lightness();
  };
  return scaling_ == ImageScaling::kAxesIndependently &&
         lightness(QPalette::Window) < lightness(QPalette::WindowText);
}

void ImageViewWidget::paintEvent(QPaintEvent*) {
  if (isOutOfPlace()) return;
  if (!pixmap_) pixmap_ = QPixmap(path_);
  if (pixmap_->isNull()) return;
  QPainter painter(this);
  painter.setRenderHint(QPainter::SmoothPixmapTransform);
  painter.drawPixmap(target(), *pixmap_, pixmap_->rect());
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
