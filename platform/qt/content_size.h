#pragma once

#include <QMainWindow>

namespace onramp::qt {

/// Gives a window the size that its contents need, and prevents the user from resizing or
/// maximising the window. The window grows with its contents, up to the size of the screen. It
/// does not shrink when the contents shrink.
class ContentSize final : public QObject {
  Q_OBJECT

 public:
  /// Watches `window`, which owns this object.
  explicit ContentSize(QMainWindow* window);

  bool eventFilter(QObject* watched, QEvent* event) override;

 private:
  [[nodiscard]] QSize neededSize() const;
  void fit();

  QMainWindow* window_;
};

}  // namespace onramp::qt
