#import "platform/cocoa/native.h"
#import "platform/cocoa/text.h"

namespace onramp {

using cocoa::nativeOf;

namespace {

// Returns the first view of class `kind` that accepts the keyboard focus, or nil. Searches `view`
// itself and then its subviews in their order.
NSView* firstKeyView(NSView* view, Class kind) {
  if ([view isKindOfClass:kind] && [view canBecomeKeyView]) return view;
  for (NSView* subview in [view subviews]) {
    if (NSView* const found = firstKeyView(subview, kind)) return found;
  }
  return nil;
}

}  // namespace

void View::setHidden(bool hidden) const {
  [nativeOf<NSView>(*this) setHidden:hidden];
}

View View::firstSubview() const {
  NSArray* const subviews = [nativeOf<NSView>(*this) subviews];
  return View(cocoa::toNative([subviews count] > 0 ? [subviews objectAtIndex:0] : nil));
}

void View::addSubview(const View& inner) const {
  NSView* const view = nativeOf<NSView>(*this);
  NSView* const added = nativeOf<NSView>(inner);
  if (!view || !added) return;
  [added setFrame:[view bounds]];
  [added setAutoresizingMask:NSViewWidthSizable | NSViewHeightSizable];
  [view addSubview:added];
  NSView* const list = firstKeyView(added, [NSTableView class]);
  [[view window] makeFirstResponder:list ? list : firstKeyView(added, [NSControl class])];
}

void View::removeFromSuperview() const {
  [nativeOf<NSView>(*this) removeFromSuperview];
}

void Control::setEnabled(bool enabled) const {
  [nativeOf<NSControl>(*this) setEnabled:enabled];
}

void TextField::setStringValue(const std::string& text) const {
  [nativeOf<NSTextField>(*this) setStringValue:cocoa::toNSString(text)];
}

}  // namespace onramp
