#pragma once

#include <QAbstractTableModel>
#include <QStringList>

namespace onramp {

class ArrayController;

namespace qt {

/// An array controller's entries as a table: one row an entry, one column an identifier.
class ListModel final : public QAbstractTableModel {
  Q_OBJECT

 public:
  /// `spokenColumns` are those that together name a row to assistive programs.
  ListModel(QStringList columns, QStringList spokenColumns, QObject* parent);

  /// The height of a row, with some room around its text.
  [[nodiscard]] static int rowHeight();

  /// Shows the entries of `controller` from now on.
  void setController(const ArrayController& controller);

  /// The controller's entries have changed.
  void reload();

  void setHeader(const QString& identifier, const QString& title);

  [[nodiscard]] int rowCount(const QModelIndex& parent = {}) const override;
  [[nodiscard]] int columnCount(const QModelIndex& parent = {}) const override;
  [[nodiscard]] QVariant data(const QModelIndex& index, int role) const override;
  [[nodiscard]] QVariant headerData(int section, Qt::Orientation orientation,
                                    int role) const override;

 private:
  /// Empty where the controller has no such entry or the entry no such text.
  [[nodiscard]] QString text(int row, const QString& column) const;

  [[nodiscard]] QString spokenName(int row) const;

  const QStringList columns_;
  const QStringList spokenColumns_;
  QStringList headers_;
  const ArrayController* controller_ = nullptr;
  int rows_ = 0;  ///< as the views know it
};

}  // namespace qt
}  // namespace onramp
