#include <QMainWindow>
#include <QScreen>
#include <QWidget>

#include "platform/outlets.h"
#include "platform/qt/content_size.h"
#include "platform/qt/native.h"

namespace onramp {

using qt::nativeOf;

// A window without a resize indicator must not be resizable, so ContentSize fixes the window's
// size.
void Window::setShowsResizeIndicator(bool shows) const {
  auto* const window = nativeOf<QMainWindow>(*this);
  if (window && !shows) qt::makeChild<qt::ContentSize>(window);
}

void Window::center() const {
  auto* const window = nativeOf<QWidget>(*this);
  if (!window) return;
  QRect frame = window->frameGeometry();
  frame.moveCenter(window->screen()->availableGeometry().center());
  window->move(frame.topLeft());
}

void Window::makeKeyWindow() const {
  if (auto* const window = nativeOf<QWidget>(*this)) window->activateWindow();
}

void Window::orderFront() const {
  auto* const window = nativeOf<QWidget>(*this);
  if (!window) return;
  window->setWindowState(window->windowState() & ~Qt::WindowMinimized);
  window->show();
  window->raise();
}

void Window::makeKeyAndOrderFront() const {
  orderFront();
  makeKeyWindow();
}

void Window::close() const {
  if (auto* const window = nativeOf<QWidget>(*this)) window->hide();
}

}  // namespace onramp
