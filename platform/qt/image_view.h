#pragma once

#include <QPixmap>
#include <QWidget>
#include <optional>

#include "platform/outlets.h"

namespace onramp::qt {

/// Shows an image file, which it reads when it is first drawn.
class ImageViewWidget final : public QWidget {
  Q_OBJECT

 public:
  using QWidget::QWidget;

  void setImage(const QString& path);
  void setScaling(ImageScaling scaling);

 protected:
  void paintEvent(QPaintEvent* event) override;

 private:
  /// A stretched picture lies behind light text, which could not be read on it.
  [[nodiscard]] bool isOutOfPlace() const;

  /// Where in this view the image goes.
  [[nodiscard]] QRectF target() const;

  QString path_;
  ImageScaling scaling_ = ImageScaling::kProportionallyDown;
  std::optional<QPixmap> pixmap_;
};

}  // namespace onramp::qt
