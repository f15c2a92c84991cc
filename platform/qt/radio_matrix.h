#pragma once

#include <QRadioButton>
#include <QWidget>

namespace onramp::qt {

/// A group of radio buttons. Each button is a child with the properties "row" and "column".
class RadioMatrixWidget final : public QWidget {
  Q_OBJECT

 public:
  using QWidget::QWidget;

  /// Returns the button at `row` and `column`, or null if there is none.
  [[nodiscard]] QRadioButton* cell(int row, int column) const;

  /// Returns the row of the selected button, or 0 if no button is selected.
  [[nodiscard]] int selectedRow() const;
};

}  // namespace onramp::qt
