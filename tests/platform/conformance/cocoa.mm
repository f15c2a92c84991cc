#import <AppKit/AppKit.h>

#include "platform/cocoa/event_loop.h"
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
    NSView* const panel = [[NSApp modalWindow] contentView];
    if (NSButton* const button = buttonIn(panel, cocoa::toNSString(title))) {
      [button performClick:nil];
      cocoa::wakeEventLoop();  // as the event of a real click does
    } else {
      clickSoon(title);
    }
  });
}

}  // namespace onramp::conformance
