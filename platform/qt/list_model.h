#pragma once

#include <QAbstractTableModel>
#include <QStringList>

namespace onramp {

class ArrayController;

namespace qt {

/// Presents an array controller's entries as a table. Each entry is a row, and each identifier in
/// `columns` is a column.
class ListModel final : public QAbstractTableModel {
  Q_OBJECT

 public:
  /// Screen readers announce each row by its text in the columns `spokenColumns`.
  ListModel(QStringList columns, QStringList spokenColumns, QObject* parent);

  /// Returns the height of a row, including some space around its text.
  [[nodiscard]] static int rowHeight();

  /// Shows the entries of `controller`, which must outlive the model.
  void setController(const ArrayController& controller);

  /// Call this when the controller's entries have changed.
  void reload();

  /// Sets the title of the column `identifier`. Does nothing if there is no column with that
  /// identifier.
  void setHeader(const QString& identifier, const QString& title);

  [[nodiscard]] int rowCount(const QModelIndex& parent = {}) const override;
  [[nodiscard]] int columnCount(const QModelIndex& parent = {}) const override;
  [[nodiscard]] QVariant data(const QModelIndex& index, int role) const override;
  [[nodiscard]] QVariant headerData(int section, Qt::Orientation orientation,
                                    int role) const override;

 private:
  /// Returns the string that the entry in `row` has under `column`, or an empty string if there is
  /// none.
  [[nodiscard]] QString text(int row, const QString& column) const;

  [[nodiscard]] QString spokenName(int row) const;

  const QStringList columns_;
  const QStringList spokenColumns_;
  QStringList headers_;
  const ArrayController* controller_ = nullptr;
  int rows_ = 0;  ///< the number of rows last reported to the views
};

}  // namespace qt
}  // namespace onramp
