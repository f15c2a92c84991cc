#pragma once

#include <QRadioButton>
#include <QWidget>

namespace onramp::qt {

/// A group of radio buttons. Each is a child with the properties "row" and "column".
class RadioMatrixWidget final : public QWidget {
  Q_OBJECT

 public:
  using QWidget::QWidget;

  /// The button in that place, or null.
  [[nodiscard]] QRadioButton* cell(int row, int column) const;

  /// Row of the selected button; 0 when none is.
  [[nodiscard]] int selectedRow() const;
};

}  // namespace onramp::qt
