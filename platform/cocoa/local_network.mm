// Makes macOS ask for the local network while the user reads the first page. Since macOS 15 a
// program needs the user's consent, and the system asks at the first use. Asked only when the
// search begins, a user who stops to read the question would miss the search.

#import <AppKit/AppKit.h>

namespace {

constexpr NSTimeInterval kBrowseDuration = 1;  // seconds

}  // namespace

/// Browses for a moment when the wizard's window first becomes the main one.
@interface OnrampLocalNetwork : NSObject
@end

@implementation OnrampLocalNetwork

+ (void)load {
  [[NSNotificationCenter defaultCenter] addObserver:self
                                           selector:@selector(ask:)
                                               name:NSWindowDidBecomeMainNotification
                                             object:nil];
}

+ (void)ask:(NSNotification*)notification {
  [[NSNotificationCenter defaultCenter] removeObserver:self];
  // A type that the information dictionary does not list is refused without a question.
  NSArray* const types = [[NSBundle mainBundle] objectForInfoDictionaryKey:@"NSBonjourServices"];
  if ([types count] == 0) return;
  NSNetServiceBrowser* const browser = [[[NSNetServiceBrowser alloc] init] autorelease];
  [browser searchForServicesOfType:[types objectAtIndex:0] inDomain:@"local."];
  [browser performSelector:@selector(stop) withObject:nil afterDelay:kBrowseDuration];
}

@end
