#include "platform/qt/list_model.h"

#include <QApplication>
#include <QFontMetrics>
#include <QSize>
#include <QTextDocument>
#include <utility>

#include "base/array_controller.h"

namespace onramp::qt {

namespace {

// Returns a tool tip that shows `text`, which may be too long for its column. Escapes text that
// looks like markup, because Qt would show it as rich text, and the name of a device could then
// make Qt load pictures.
QString toolTip(const QString& text) {
  return Qt::mightBeRichText(text) ? Qt::convertFromPlainText(text) : text;
}

}  // namespace

ListModel::ListModel(QStringList columns, QStringList spokenColumns, QObject* parent)
    : QAbstractTableModel(parent),
      columns_(std::move(columns)),
      spokenColumns_(std::move(spokenColumns)),
      headers_(columns_) {}

int ListModel::rowHeight() {
  constexpr int kRoom = 8;
  return QFontMetrics(QApplication::font()).height() + kRoom;
}

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
  switch (role) {
    case Qt::DisplayRole:
      return text(index.row(), columns_.at(index.column()));
    case Qt::ToolTipRole:
      return toolTip(text(index.row(), columns_.at(index.column())));
    case Qt::AccessibleTextRole:
      return index.column() == 0 ? spokenName(index.row()) : QVariant();
    case Qt::SizeHintRole:  // a single column is as wide as its view and elides wider text
      return columns_.size() == 1 ? QSize(0, rowHeight()) : QVariant();
    default:
      return {};
  }
}

QString ListModel::spokenName(int row) const {
  QStringList texts;
  for (const QString& column : spokenColumns_)
    texts.append(text(row, column));
  return texts.join(QStringLiteral(", "));
}

QString ListModel::text(int row, const QString& column) const {
  const auto entry = static_cast<std::size_t>(row);
  if (!controller_ || entry >= controller_->arrangedObjects().size()) return {};
  return QString::fromStdString(
      controller_->arrangedObjects()[entry].string(column.toStdString()).value_or(""));
}

QVariant ListModel::headerData(int section, Qt::Orientation orientation, int role) const {
  if (orientation != Qt::Horizontal || role != Qt::DisplayRole) return {};
  return headers_.value(section);
}

}  // namespace onramp::qt
