// Starts a short-lived thread when the program is loaded, so that GNUstep creates its lock for
// string attributes early. GNUstep creates this lock when the program starts its second thread. If
// the main thread were using string attributes at that moment, it would then unlock a lock that it
// has not locked, which raises an exception.

#import "platform/cocoa/gnustep/appkit_additions.h"

@interface OnrampThreads : NSObject
@end

@implementation OnrampThreads

+ (void)load {
  @autoreleasepool {
    [NSThread detachNewThreadSelector:@selector(doNothing) toTarget:self withObject:nil];
  }
}

+ (void)doNothing {
}

@end
