// Makes a posted event wake the main loop, as on macOS. A GNUstep loop fires its timers and
// performs its messages before it waits for input, and does not notice an event that a timer or
// message has posted until other input arrives.

#include <sys/eventfd.h>

#include <cstdint>

#import "platform/cocoa/gnustep/appkit_additions.h"
#import "platform/cocoa/gnustep/method_exchange.h"

/// An input source of the main loop that has input after an event was posted.
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
  eventfd_write(_descriptor, 1);  // a failure means that the loop is being woken already
}

- (void)receivedEvent:(void*)data
                 type:(RunLoopEventType)type
                extra:(void*)extra
              forMode:(NSString*)mode {
  eventfd_t posted = 0;
  eventfd_read(_descriptor, &posted);
}

@end
