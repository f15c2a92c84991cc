#import "platform/cocoa/native.h"

namespace onramp {

using cocoa::nativeOf;

void Window::setShowsResizeIndicator(bool shows) const {
  [nativeOf<NSWindow>(*this) setShowsResizeIndicator:shows];
}

void Window::center() const {
  [nativeOf<NSWindow>(*this) center];
}

void Window::makeKeyWindow() const {
  [nativeOf<NSWindow>(*this) makeKeyWindow];
}

void Window::orderFront() const {
  [nativeOf<NSWindow>(*this) orderFront:nil];
}

void Window::makeKeyAndOrderFront() const {
  NSWindow* const window = nativeOf<NSWindow>(*this);
  [window makeKeyAndOrderFront:nil];
  // Since macOS 14, the system may refuse to activate the application. Even then, the window must
  // appear in front of the active application's windows.
  if (![NSApp isActive]) [window orderFrontRegardless];
}

void Window::close() const {
  [nativeOf<NSWindow>(*this) close];
}

}  // namespace onramp
