// Makes a posted event wake the main loop, as on macOS. A GNUstep loop first runs its timers and
// delayed messages, and then waits for input. If a timer or message has posted an event, the loop
// does not notice the event until some input arrives.

#include <sys/eventfd.h>

#include <cstdint>

#import "platform/cocoa/gnustep/appkit_additions.h"
#import "platform/cocoa/gnustep/method_exchange.h"

/// An input source of the main loop. Every posted event makes input available at this source, which
/// wakes the loop.
@interface OnrampPostedEvents : NSObject <RunLoopEvents> {
  int _descriptor;
}
@end

namespace {

using PostEvent = void(id, SEL, NSEvent*, BOOL);

PostEvent* originalPostEvent = nullptr;

}  // namespace

@implementation OnrampPostedEvents

+ (void)load {
  originalPostEvent = onramp::gnustep::replaceMethod(
      [NSApplication class], @selector(postEvent:atStart:),
      +[](id self, SEL selector, NSEvent* event, BOOL atStart) {
        static OnrampPostedEvents* const source = [[OnrampPostedEvents alloc] init];
        originalPostEvent(self, selector, event, atStart);
        [source wakeLoop];
      });
}

- (instancetype)init {
  self = [super init];
  if (!self) return nil;
  _descriptor = eventfd(0, EFD_CLOEXEC | EFD_NONBLOCK);
  for (NSString *mode in [NSArray arrayWithObjects:NSDefaultRunLoopMode, NSModalPanelRunLoopMode,
                                                   NSEventTrackingRunLoopMode, nil]) {
    [[NSRunLoop mainRunLoop] addEvent:reinterpret_cast<void*>(std::intptr_t{_descriptor})
                                 type:ET_RDESC
                              watcher:self
                              forMode:mode];
  }
  return self;
}

- (void)wakeLoop {
  eventfd_write(_descriptor, 1);  // fails only if the counter is full; that wakes the loop, too
}

- (void)receivedEvent:(void*)data
                 type:(RunLoopEventType)type
                extra:(void*)extra
              forMode:(NSString*)mode {
  eventfd_t posted = 0;
  eventfd_read(_descriptor, &posted);
}

@end
