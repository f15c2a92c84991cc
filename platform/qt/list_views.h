#pragma once

#include <QListView>
#include <QTreeView>

#include "platform/qt/type_ahead.h"

namespace onramp::qt {

/// The least height of a list that shows some rows at a time, without its frame and header.
[[nodiscard]] int leastListHeight();

/// The least width of a column of names.
[[nodiscard]] int leastNameWidth();

/// Draws the whole frame again when the focus comes or goes. Qt's views draw only their rows again.
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

/// A list of one column.
class ListWidget final : public FramedView<QListView> {
  Q_OBJECT

 public:
  using FramedView<QListView>::FramedView;

  void keyboardSearch(const QString& text) override { typeAhead_.type(*this, text); }
  [[nodiscard]] QSize minimumSizeHint() const override;

 private:
  TypeAhead typeAhead_;
};

/// A list of several columns, each as wide as its contents. The first gets what the others leave
/// and gives way to them. Once the user has dragged a column's edge, all widths are theirs.
class ColumnsWidget final : public FramedView<QTreeView> {
  Q_OBJECT

 public:
  explicit ColumnsWidget(QWidget* parent = nullptr);

  /// Call it after every change of the contents or of a header.
  void fitColumns();

  void keyboardSearch(const QString& text) override { typeAhead_.type(*this, text); }
  [[nodiscard]] QSize minimumSizeHint() const override;

 protected:
  void resizeEvent(QResizeEvent* event) override;

 private:
  /// The width at which nothing of the column is cut.
  [[nodiscard]] int neededWidth(int column) const;

  /// What the columns after the first need together.
  [[nodiscard]] int neededWidthOfOthers() const;

  void sectionResized(int column, int width);

  TypeAhead typeAhead_;
  bool isUsersLayout_ = false;
};

}  // namespace onramp::qt
