#include "platform/qt/radio_matrix.h"

#include <QVariant>

#include "platform/qt/native.h"

namespace onramp {

namespace qt {

QRadioButton* RadioMatrixWidget::cell(int row, int column) const {
  for (QRadioButton* const button : findChildren<QRadioButton*>()) {
    if (button->property("row").toInt() == row && button->property("column").toInt() == column) {
      return button;
    }
  }
  return nullptr;
}

int RadioMatrixWidget::selectedRow() const {
  for (const QRadioButton* const button : findChildren<QRadioButton*>()) {
    if (button->isChecked()) return button->property("row").toInt();
  }
  return 0;
}

}  // namespace qt

using qt::nativeOf;
using qt::RadioMatrixWidget;

void RadioMatrix::setTitle(int row, int column, const std::string& title) const {
  const auto* const matrix = nativeOf<RadioMatrixWidget>(*this);
  if (QRadioButton* const button = matrix ? matrix->cell(row, column) : nullptr) {
    button->setText(qt::titleText(title));
  }
}

void RadioMatrix::selectCell(int row, int column) const {
  const auto* const matrix = nativeOf<RadioMatrixWidget>(*this);
  if (QRadioButton* const button = matrix ? matrix->cell(row, column) : nullptr) {
    button->setChecked(true);
  }
}

int RadioMatrix::selectedRow() const {
  const auto* const matrix = nativeOf<RadioMatrixWidget>(*this);
  return matrix ? matrix->selectedRow() : 0;
}

}  // namespace onramp
