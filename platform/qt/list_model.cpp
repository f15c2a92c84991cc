#include "platform/qt/list_model.h"

#include <QApplication>
#include <QFontMetrics>
#include <QSize>
#include <utility>

#include "base/array_controller.h"

namespace onramp::qt {

namespace {

// Rows a little higher than their text are easier to read and to hit.
QSize rowSize() {
  constexpr int kRoom = 8;
  return {0, QFontMetrics(QApplication::font()).height() + kRoom};
}

}  // namespace

ListModel::ListModel(QStringList columns, QObject* parent)
    : QAbstractTableModel(parent), columns_(std::move(columns)), headers_(columns_) {}

void ListModel::setController(const ArrayController& controller) {
  controller_ = &controller;
  reload();
}

void ListModel::reload() {
  beginResetModel();
  rows_ = static_cast<int>(controller_->arrangedObjects().size());
  endResetModel();
}

void ListModel::setHeader(const QString& identifier, const QString& title) {
  const auto column = columns_.indexOf(identifier);
  if (column < 0) return;
  headers_[column] = title;
  Q_EMIT headerDataChanged(Qt::Horizontal, static_cast<int>(column), static_cast<int>(column));
}

int ListModel::rowCount(const QModelIndex& parent) const {
  return parent.isValid() ? 0 : rows_;
}

int ListModel::columnCount(const QModelIndex& parent) const {
  return parent.isValid() ? 0 : static_cast<int>(columns_.size());
}

QVariant ListModel::data(const QModelIndex& index, int role) const {
  if (role == Qt::SizeHintRole) return rowSize();
  // A text too long for its column can be read in full as a tool tip.
  if (role != Qt::DisplayRole && role != Qt::ToolTipRole) return {};
  const auto row = static_cast<std::size_t>(index.row());
  if (!controller_ || row >= controller_->arrangedObjects().size()) return {};
  const Dictionary& entry = controller_->arrangedObjects()[row];
  return QString::fromStdString(
      entry.string(columns_.at(index.column()).toStdString()).value_or(""));
}

QVariant ListModel::headerData(int section, Qt::Orientation orientation, int role) const {
  if (orientation != Qt::Horizontal || role != Qt::DisplayRole) return {};
  return headers_.value(section);
}

}  // namespace onramp::qt
