#pragma once

#include <QMainWindow>

namespace onramp::qt {

/// Gives a window that the user cannot resize the size that its contents need. The window grows
/// with them, up to the size of its screen, and never shrinks.
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
