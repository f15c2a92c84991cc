// GNUstep stores the time of the last event. This file prevents the stored time from going
// backwards. Requests for the keyboard focus carry this time, and the window manager refuses a
// request whose time looks old. GNUstep also stores a number from each "_NET_WM_PING" message as a
// time, but some window managers send a number that is not a time. Openbox, for example, sends a
// count that starts at one.

#import "platform/cocoa/gnustep/appkit_additions.h"
#import "platform/cocoa/gnustep/method_exchange.h"

namespace {

using SetTime = void(id, SEL, unsigned long);

// Times are milliseconds in 32 bits, and restart at 0 after the largest number. A step back of at
// least this size means that they have restarted.
constexpr unsigned long kGreatestStepBack = 0xF0000000UL;

SetTime* originalSetLastTime = nullptr;
unsigned long lastTime = 0;

void setLastTime(id self, SEL selector, unsigned long time) {
  if (time < lastTime && lastTime - time < kGreatestStepBack) return;
  lastTime = time;
  originalSetLastTime(self, selector, time);
}

}  // namespace

@interface OnrampEventTimes : NSObject
@end

@implementation OnrampEventTimes

+ (void)load {
  @autoreleasepool {
    [[NSNotificationCenter defaultCenter] addObserver:self
                                             selector:@selector(replace:)
                                                 name:NSApplicationWillFinishLaunchingNotification
                                               object:nil];
  }
}

// Runs after GNUstep has created the application object and, with it, loaded the X11 backend, which
// defines the class XGServer.
+ (void)replace:(NSNotification*)notification {
  Class const server = NSClassFromString(@"XGServer");
  if (!server) return;
  originalSetLastTime =
      onramp::gnustep::replaceMethod(server, @selector(setLastTime:), setLastTime);
}

@end
