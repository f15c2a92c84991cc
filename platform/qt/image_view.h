#pragma once

#include <QPixmap>
#include <QWidget>

#include "platform/outlets.h"

namespace onramp::qt {

/// Shows an image file, which it reads when it is first drawn in a size.
class ImageViewWidget final : public QWidget {
  Q_OBJECT

 public:
  using QWidget::QWidget;

  void setImage(const QString& path);
  void setScaling(ImageScaling scaling);

 protected:
  void paintEvent(QPaintEvent* event) override;

 private:
  /// The image read in the size that it takes up in this view now.
  [[nodiscard]] QPixmap read() const;

  QString path_;
  ImageScaling scaling_ = ImageScaling::kProportionallyDown;
  QPixmap drawn_;
  QSize drawnFor_;
};

}  // namespace onramp::qt
