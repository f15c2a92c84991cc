#pragma once

#include <QPixmap>
#include <QWidget>
#include <optional>

#include "platform/outlets.h"

namespace onramp::qt {

/// Shows an image file. The file is read when the image is first drawn.
class ImageViewWidget final : public QWidget {
  Q_OBJECT

 public:
  using QWidget::QWidget;

  void setImage(const QString& path);
  void setScaling(ImageScaling scaling);

 protected:
  void paintEvent(QPaintEvent* event) override;

 private:
  /// Returns whether the image must not be drawn. A stretched image is meant as a background for
  /// dark text. In a dark colour scheme, the text is light and would be unreadable on the image.
  [[nodiscard]] bool isOutOfPlace() const;

  /// Returns the rectangle in this view in which the image is drawn.
  [[nodiscard]] QRectF target() const;

  QString path_;
  ImageScaling scaling_ = ImageScaling::kProportionallyDown;
  std::optional<QPixmap> pixmap_;
};

}  // namespace onramp::qt
