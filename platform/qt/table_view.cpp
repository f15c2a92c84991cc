#include <QAbstractItemView>
#include <QHeaderView>
#include <QItemSelectionModel>
#include <QTreeView>

#include "base/array_controller.h"
#include "platform/outlets.h"
#include "platform/qt/list_model.h"
#include "platform/qt/native.h"

namespace onramp {

namespace {

using qt::ListModel;
using qt::nativeOf;

// A view has its model from the start: an interface file names the columns, and headers may be set
// before there is anything to show.
ListModel* modelOf(QAbstractItemView* view) {
  if (!view) return nullptr;
  if (auto* const model = qobject_cast<ListModel*>(view->model())) return model;
  auto* const model = qt::makeChild<ListModel>(view, view->property("columns").toStringList());
  view->setModel(model);
  return model;
}

ListModel* modelOf(const TableView& table) {
  return modelOf(nativeOf<QAbstractItemView>(table));
}

QHeaderView* headerOf(const TableView& table) {
  const auto* const view = nativeOf<QTreeView>(table);
  return view ? view->header() : nullptr;
}

// The first column takes what room the others leave.
void layOutColumns(QAbstractItemView* view) {
  auto* const tree = qobject_cast<QTreeView*>(view);
  if (!tree) return;
  tree->header()->setStretchLastSection(false);
  for (int column = 0; column < tree->header()->count(); ++column) {
    tree->header()->setSectionResizeMode(
        column, column == 0 ? QHeaderView::Stretch : QHeaderView::ResizeToContents);
  }
}

void showSelection(QAbstractItemView* view, const ArrayController& controller) {
  const auto selected = controller.selectionIndex();
  if (!selected) {
    view->clearSelection();
    view->setCurrentIndex({});
  } else {
    const QModelIndex index = view->model()->index(static_cast<int>(*selected), 0);
    view->selectionModel()->setCurrentIndex(
        index, QItemSelectionModel::ClearAndSelect | QItemSelectionModel::Rows);
    view->scrollTo(index);
  }
}

// Takes over the row that the user has selected; a selection that they took away comes back.
void takeSelection(QAbstractItemView* view, ArrayController& controller) {
  const QModelIndexList rows = view->selectionModel()->selectedRows();
  if (rows.isEmpty()) {
    showSelection(view, controller);
    return;
  }
  const auto row = static_cast<std::size_t>(rows.first().row());
  if (row != controller.selectionIndex()) controller.choose(row);
}

}  // namespace

void TableView::bind(ArrayController& controller) const {
  auto* const view = nativeOf<QAbstractItemView>(*this);
  if (!view) return;
  ListModel* const model = modelOf(view);
  model->setController(controller);
  layOutColumns(view);
  controller.bind(
      [view, model, &controller] {
        model->reload();
        showSelection(view, controller);
      },
      [view, &controller] { showSelection(view, controller); });
  QObject::connect(view->selectionModel(), &QItemSelectionModel::selectionChanged, view,
                   [view, &controller] { takeSelection(view, controller); });
  QObject::connect(view, &QAbstractItemView::pressed, view,
                   [&controller](const QModelIndex& index) {
                     controller.choose(static_cast<std::size_t>(index.row()));
                   });
}

void TableView::setAllowsColumnReordering(bool allows) const {
  if (QHeaderView* const header = headerOf(*this)) header->setSectionsMovable(allows);
}

void TableView::setAllowsColumnSelection(bool allows) const {
  if (QHeaderView* const header = headerOf(*this)) header->setSectionsClickable(allows);
}

void TableView::setColumnHeader(std::string_view identifier, const std::string& title) const {
  if (ListModel* const model = modelOf(*this)) {
    model->setHeader(
        QString::fromUtf8(identifier.data(), static_cast<qsizetype>(identifier.size())),
        QString::fromStdString(title));
  }
}

// Nothing can be edited: the model takes no values.
void TableView::setColumnEditable(std::string_view, bool) const {}

}  // namespace onramp
