#include <QAbstractItemView>
#include <QHeaderView>
#include <QItemSelectionModel>
#include <QPushButton>
#include <QTreeView>

#include "base/array_controller.h"
#include "platform/outlets.h"
#include "platform/qt/list_model.h"
#include "platform/qt/list_views.h"
#include "platform/qt/native.h"

namespace onramp {

namespace {

using qt::ListModel;
using qt::nativeOf;

// Returns the view's model, or null if `view` is null. Creates the model on the first call for a
// view, because a header can be set before bind().
ListModel* modelOf(QAbstractItemView* view) {
  if (!view) return nullptr;
  if (auto* const model = qobject_cast<ListModel*>(view->model())) return model;
  auto* const model = qt::makeChild<ListModel>(view, view->property("columns").toStringList(),
                                               view->property(qt::kSpokenColumns).toStringList());
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

void fitColumns(QAbstractItemView* view) {
  if (auto* const columns = qobject_cast<qt::ColumnsWidget*>(view)) columns->fitColumns();
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

// Tells the controller which row the user has selected. If no row is selected, selects the
// controller's row again, because assistive technology may deselect the old row before it selects
// a new one. Both rows are then selected for a moment, so this function looks only at `added`,
// which has only the new row.
void takeSelection(QAbstractItemView* view, ArrayController& controller,
                   const QItemSelection& added) {
  if (!view->selectionModel()->hasSelection()) {
    showSelection(view, controller);
  } else if (!added.isEmpty()) {
    const auto row = static_cast<std::size_t>(added.first().top());
    if (row != controller.selectionIndex()) controller.choose(row);
  }
}

// Clicks the window's default button after the list has handled the double-click, because the
// button's action can remove the list. Does nothing if the button is hidden or disabled.
void clickDefaultButtonSoon(const QWidget& window) {
  for (QPushButton* const button : window.findChildren<QPushButton*>()) {
    if (!button->isDefault() || !button->isVisible() || !button->isEnabled()) continue;
    QMetaObject::invokeMethod(button, &QPushButton::click, Qt::QueuedConnection);
    return;
  }
}

}  // namespace

void TableView::bind(ArrayController& controller) const {
  auto* const view = nativeOf<QAbstractItemView>(*this);
  if (!view) return;
  ListModel* const model = modelOf(view);
  model->setController(controller);
  controller.bind(
      [view, model, &controller] {
        model->reload();
        fitColumns(view);
        showSelection(view, controller);
      },
      [view, &controller] { showSelection(view, controller); });
  QObject::connect(
      view->selectionModel(), &QItemSelectionModel::selectionChanged, view,
      [view, &controller](const QItemSelection& added) { takeSelection(view, controller, added); });
  QObject::connect(view, &QAbstractItemView::pressed, view,
                   [&controller](const QModelIndex& index) {
                     controller.choose(static_cast<std::size_t>(index.row()));
                   });
  QObject::connect(view, &QAbstractItemView::doubleClicked, view,
                   [view] { clickDefaultButtonSoon(*view->window()); });
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
    fitColumns(nativeOf<QAbstractItemView>(*this));
  }
}

// Does nothing, because the model accepts no edits.
void TableView::setColumnEditable(std::string_view, bool) const {}

}  // namespace onramp
