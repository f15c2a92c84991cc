#include "platform/qt/content_size.h"

#include <QEvent>
#include <QLayout>
#include <QMenuBar>
#include <QScreen>
#include <algorithm>

namespace onramp::qt {

namespace {

constexpr int kTitleBarHeight = 32;  // in pixels; a title bar is assumed to be at least this high

}  // namespace

ContentSize::ContentSize(QMainWindow* window) : QObject(window), window_(window) {
  window->installEventFilter(this);
  window->setWindowFlag(Qt::WindowMaximizeButtonHint, false);
  fit();
}

bool ContentSize::eventFilter(QObject*, QEvent* event) {
  if (event->type() == QEvent::LayoutRequest || event->type() == QEvent::Show) fit();
  return false;
}

// The height is computed for the needed width, because the height of wrapped text depends on the
// width.
QSize ContentSize::neededSize() const {
  const QLayout* const contents = window_->centralWidget()->layout();
  const int menu = window_->menuWidget() ? window_->menuWidget()->sizeHint().height() : 0;
  QSize needed = window_->size().expandedTo(contents->totalMinimumSize() + QSize(0, menu));
  if (contents->hasHeightForWidth()) {
    const int height = contents->totalMinimumHeightForWidth(needed.width());
    needed.setHeight(std::max(needed.height(), height + menu));
  }
  return needed;
}

void ContentSize::fit() {
  const QWidget* const contents = window_->centralWidget();
  if (!contents || !contents->layout()) return;
  const QRect screen = window_->screen()->availableGeometry();
  const int title =
      std::max(window_->frameGeometry().height() - window_->height(), kTitleBarHeight);
  const QSize size = neededSize().boundedTo(screen.size() - QSize(0, title));
  if (size == window_->size() && window_->maximumSize() == size) return;
  const QSize grown = size - window_->size();
  window_->setFixedSize(size);
  if (!window_->isVisible()) return;
  // Keeps the middle of the window in place as far as the screen allows.
  const QPoint corner = window_->pos() - QPoint(grown.width(), grown.height()) / 2;
  const QPoint last = screen.bottomRight() - QPoint(size.width(), size.height() + title);
  window_->move(std::clamp(corner.x(), screen.left(), std::max(screen.left(), last.x())),
                std::clamp(corner.y(), screen.top(), std::max(screen.top(), last.y())));
}

}  // namespace onramp::qt
