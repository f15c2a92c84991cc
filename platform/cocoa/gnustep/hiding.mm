// When the application hides itself, its windows disappear as with AppKit, and no icons take their
// place. GNUstep would replace each window with an icon, because the application has no icon
// that the user could click. If a window came back before its icon had appeared, the window would
// not always get the keyboard focus.

#import "platform/cocoa/gnustep/appkit_additions.h"
#import "platform/cocoa/gnustep/method_exchange.h"

namespace {

using Action = void(id, SEL, id);
using Question = BOOL(id, SEL);
using PlainAction = void(id, SEL);

Action* originalHide = nullptr;
Action* originalUnhide = nullptr;
Action* originalMakeKeyAndOrderFront = nullptr;
PlainAction* originalOrderFrontRegardless = nullptr;
Question* originalIsHidden = nullptr;
bool isHiddenByItself = false;

// Returns the windows that were on the screen when the application hid itself, from front to back.
NSMutableArray* hiddenWindows() {
  static NSMutableArray* const windows = [[NSMutableArray alloc] init];
  return windows;
}

// A call with a sender comes from the menu. The user then needs GNUstep's icons to bring the
// application back.
void hide(id self, SEL selector, id sender) {
  if (sender) {
    originalHide(self, selector, sender);
    return;
  }
  for (NSWindow* window in [self orderedWindows]) {
    if (![window isVisible] || ![window canHide]) continue;
    [hiddenWindows() addObject:window];
    [window orderOut:nil];
  }
  isHiddenByItself = true;
  [self deactivate];
}

void unhide(id self, SEL selector, id sender) {
  if (!isHiddenByItself) {
    originalUnhide(self, selector, sender);
    return;
  }
  isHiddenByItself = false;
  for (NSWindow* window in [hiddenWindows() reverseObjectEnumerator])
    [window orderFrontRegardless];
  [hiddenWindows() removeAllObjects];
  [self activateIgnoringOtherApps:YES];
}

BOOL isHidden(id self, SEL selector) {
  return isHiddenByItself || originalIsHidden(self, selector);
}

// The windows of a hidden application must not appear on the screen.
void makeKeyAndOrderFront(id self, SEL selector, id sender) {
  if (!isHiddenByItself) originalMakeKeyAndOrderFront(self, selector, sender);
}

void orderFrontRegardless(id self, SEL selector) {
  if (!isHiddenByItself) originalOrderFrontRegardless(self, selector);
}

}  // namespace

@interface OnrampHiding : NSObject
@end

@implementation OnrampHiding

+ (void)load {
  using onramp::gnustep::replaceMethod;
  originalHide = replaceMethod([NSApplication class], @selector(hide:), hide);
  originalUnhide = replaceMethod([NSApplication class], @selector(unhide:), unhide);
  originalIsHidden = replaceMethod([NSApplication class], @selector(isHidden), isHidden);
  originalMakeKeyAndOrderFront =
      replaceMethod([NSWindow class], @selector(makeKeyAndOrderFront:), makeKeyAndOrderFront);
  originalOrderFrontRegardless =
      replaceMethod([NSWindow class], @selector(orderFrontRegardless), orderFrontRegardless);
}

@end
