#import <AppKit/AppKit.h>

#import "platform/cocoa/text.h"
#include "platform/run_loop.h"
#include "tests/platform/conformance/front_end.h"

namespace onramp::conformance {

namespace {

NSButton* buttonIn(NSView* view, NSString* title) {
  if ([view isKindOfClass:[NSButton class]] &&
      [[static_cast<NSButton*>(view) title] isEqualToString:title]) {
    return static_cast<NSButton*>(view);
  }
  for (NSView* inner in [view subviews]) {
    if (NSButton* const button = buttonIn(inner, title)) return button;
  }
  return nil;
}

}  // namespace

void clickSoon(const std::string& title) {
  scheduleTimer(std::chrono::milliseconds(10), [title] {
    for (NSWindow* shown in [NSApp windows]) {
      if (![shown isVisible]) continue;
      NSButton* const button = buttonIn([shown contentView], cocoa::toNSString(title));
      if (!button) continue;
      [button performClick:nil];
      return;
    }
    clickSoon(title);
  });
}

}  // namespace onramp::conformance
