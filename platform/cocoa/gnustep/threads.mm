// Makes GNUstep create its locks before a second thread exists. GNUstep creates the lock around the
// attributes of texts when the first other thread starts. If the main thread is using a text at
// that moment, it unlocks the lock without having locked it, which raises an exception.

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
