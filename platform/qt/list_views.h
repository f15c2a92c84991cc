#pragma once

#include <QListView>
#include <QTimer>
#include <QTreeView>

#include "platform/qt/type_ahead.h"

namespace onramp::qt {

/// Returns the minimum height of a list's row area, excluding the frame and header.
[[nodiscard]] int leastListHeight();

/// Returns the minimum width of a column of names.
[[nodiscard]] int leastNameWidth();

/// A view that redraws its frame when it gets or loses the focus, because the frame shows the
/// focus. Qt's views redraw only their rows.
template <typename View>
class FramedView : public View {
 public:
  using View::View;

 protected:
  void focusInEvent(QFocusEvent* event) override {
    View::focusInEvent(event);
    QWidget::update();
  }
  void focusOutEvent(QFocusEvent* event) override {
    View::focusOutEvent(event);
    QWidget::update();
  }
};

/// A list with one column.
class ListWidget final : public FramedView<QListView> {
  Q_OBJECT

 public:
  using FramedView<QListView>::FramedView;

  void keyboardSearch(const QString& text) override { typeAhead_.type(*this, text); }
  [[nodiscard]] QSize minimumSizeHint() const override;

 private:
  TypeAhead typeAhead_;
};

/// A list with several columns. The first column gets the width that the other columns leave free,
/// but at least leastNameWidth(). Each other column is as wide as its contents. Once the user has
/// dragged a column's edge, the widths are no longer adjusted.
class ColumnsWidget final : public FramedView<QTreeView> {
  Q_OBJECT

 public:
  explicit ColumnsWidget(QWidget* parent = nullptr);

  /// Call this whenever the contents or a header changes. Adjusts the column widths at once, or
  /// after a short pause if the last adjustment was only a moment ago. All calls during the pause
  /// share one adjustment.
  void fitColumns();

  void keyboardSearch(const QString& text) override { typeAhead_.type(*this, text); }
  [[nodiscard]] QSize minimumSizeHint() const override;

 protected:
  void resizeEvent(QResizeEvent* event) override;

 private:
  /// Returns the width that the column needs to show its header and all its cells in full.
  [[nodiscard]] int neededWidth(int column) const;

  /// Returns the total width that all columns except the first one need.
  [[nodiscard]] int neededWidthOfOthers() const;

  void adjustWidths();
  void sectionResized(int column, int width);

  QTimer pause_;  ///< active for a short time after an adjustment
  bool isAdjustmentDue_ = false;
  TypeAhead typeAhead_;
  bool isUsersLayout_ = false;
};

}  // namespace onramp::qt
