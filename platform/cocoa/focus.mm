#import "platform/cocoa/focus.h"

namespace onramp::cocoa {

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

void focusFirstControl(NSView* view) {
  NSView* const list = firstKeyView(view, [NSTableView class]);
  NSView* const first = list ? list : firstKeyView(view, [NSControl class]);
  if (first) [[view window] makeFirstResponder:first];
}

}  // namespace onramp::cocoa
