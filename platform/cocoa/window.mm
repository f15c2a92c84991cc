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
  [nativeOf<NSWindow>(*this) makeKeyAndOrderFront:nil];
}

void Window::close() const {
  [nativeOf<NSWindow>(*this) close];
}

}  // namespace onramp
