// An application that can hide itself and come back. Where it has no icon of its own to click on,
// GNUstep makes an icon of each window instead, and a window that is brought back before its icon
// is on the screen is not always given the keyboard.

#import "platform/cocoa/gnustep/appkit_additions.h"
#import "platform/cocoa/gnustep/method_exchange.h"

namespace {

using Hide = void(id, SEL, id);

Hide* originalHide = nullptr;

// From front to back, while the application is hidden.
NSMutableArray* hiddenWindows() {
  static NSMutableArray* const windows = [[NSMutableArray alloc] init];
  return windows;
}

// Whoever hides it from the menu needs the icons to bring it back.
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
  [self deactivate];
}

void unhideWithoutActivation(id, SEL) {
  for (NSWindow* window in [hiddenWindows() reverseObjectEnumerator])
    [window orderFrontRegardless];
  [hiddenWindows() removeAllObjects];
}

}  // namespace

@interface OnrampHiding : NSObject
@end

@implementation OnrampHiding

+ (void)load {
  using onramp::gnustep::replaceMethod;
  originalHide = replaceMethod([NSApplication class], @selector(hide:), hide);
  replaceMethod([NSApplication class], @selector(unhideWithoutActivation), unhideWithoutActivation);
}

@end
