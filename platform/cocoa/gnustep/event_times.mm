// The time of the last event, which goes with every request for the keyboard. GNUstep takes it from
// a window manager's "_NET_WM_PING" as well, whose number need not be a time: that of Openbox
// counts from one. A request as old as that is refused.

#import "platform/cocoa/gnustep/appkit_additions.h"
#import "platform/cocoa/gnustep/method_exchange.h"

namespace {

using SetTime = void(id, SEL, unsigned long);

// Times are milliseconds in 32 bits: a step back that is greater than this is a wrap around.
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

// What speaks to the X server is loaded with the application object.
+ (void)replace:(NSNotification*)notification {
  Class const server = NSClassFromString(@"XGServer");
  if (!server) return;
  originalSetLastTime =
      onramp::gnustep::replaceMethod(server, @selector(setLastTime:), setLastTime);
}

@end
