#include "platform/qt/list_views.h"

#include <QApplication>
#include <QFontMetrics>
#include <QHeaderView>
#include <QScrollBar>
#include <algorithm>
#include <chrono>

#include "platform/qt/list_model.h"

namespace onramp::qt {

namespace {

constexpr int kLeastRows = 6;
constexpr int kLeastNameLetters = 24;

// Adjusting the column widths measures every row. Without these pauses, a search that finds
// hundreds of devices would spend a third of its time on adjustments.
constexpr std::chrono::milliseconds kPauseBetweenAdjustments{50};

}  // namespace

int leastListHeight() {
  return kLeastRows * ListModel::rowHeight();
}

int leastNameWidth() {
  return kLeastNameLetters * QFontMetrics(QApplication::font()).averageCharWidth();
}

QSize ListWidget::minimumSizeHint() const {
  const int frames = 2 * frameWidth();
  return {leastNameWidth() + frames, leastListHeight() + frames};
}

ColumnsWidget::ColumnsWidget(QWidget* parent) : FramedView<QTreeView>(parent) {
  header()->setSectionResizeMode(QHeaderView::Interactive);
  header()->setStretchLastSection(true);
  setTextElideMode(Qt::ElideMiddle);
  pause_.setSingleShot(true);
  pause_.setInterval(kPauseBetweenAdjustments);
  connect(&pause_, &QTimer::timeout, this, [this] {
    if (isAdjustmentDue_) fitColumns();
  });
  connect(header(), &QHeaderView::sectionResized, this,
          [this](int column, int, int width) { sectionResized(column, width); });
}

int ColumnsWidget::neededWidth(int column) const {
  return std::max(sizeHintForColumn(column), header()->sectionSizeHint(column));
}

int ColumnsWidget::neededWidthOfOthers() const {
  int needed = 0;
  for (int column = 1; column < header()->count(); ++column)
    needed += neededWidth(column);
  return needed;
}

void ColumnsWidget::fitColumns() {
  isAdjustmentDue_ = pause_.isActive();
  if (isAdjustmentDue_) return;
  adjustWidths();
  pause_.start();
}

void ColumnsWidget::adjustWidths() {
  updateGeometry();
  if (isUsersLayout_ || header()->count() == 0) return;
  for (int column = 1; column < header()->count(); ++column) {
    header()->resizeSection(column, neededWidth(column));
  }
  const int left = viewport()->width() - neededWidthOfOthers();
  header()->resizeSection(0, std::max(left, leastNameWidth()));
}

QSize ColumnsWidget::minimumSizeHint() const {
  const int frames = 2 * frameWidth();
  const int width =
      leastNameWidth() + neededWidthOfOthers() + verticalScrollBar()->sizeHint().width();
  return {width + frames, header()->sizeHint().height() + leastListHeight() + frames};
}

void ColumnsWidget::resizeEvent(QResizeEvent* event) {
  QTreeView::resizeEvent(event);
  adjustWidths();
}

// The user may make only the first column too narrow for its text.
void ColumnsWidget::sectionResized(int column, int width) {
  if (QGuiApplication::mouseButtons() == Qt::NoButton) return;
  isUsersLayout_ = true;
  if (column > 0 && width < neededWidth(column))
    header()->resizeSection(column, neededWidth(column));
}

}  // namespace onramp::qt
