// Makes macOS ask for access to the local network while the user reads the first page. Since macOS
// 15 a program needs the user's consent, and the system asks for it when the program first uses the
// network. If the system asked only when the search begins, the search might end before the user
// has answered.

#import <AppKit/AppKit.h>

namespace {

constexpr NSTimeInterval kBrowseDuration = 1;  // seconds

}  // namespace

/// Browses for a moment when the wizard's window becomes the main window for the first time.
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
  // For a type that is not listed in the information dictionary, macOS refuses to browse and does
  // not ask the user.
  NSArray* const types = [[NSBundle mainBundle] objectForInfoDictionaryKey:@"NSBonjourServices"];
  if ([types count] == 0) return;
  NSNetServiceBrowser* const browser = [[[NSNetServiceBrowser alloc] init] autorelease];
  [browser searchForServicesOfType:[types objectAtIndex:0] inDomain:@"local."];
  [browser performSelector:@selector(stop) withObject:nil afterDelay:kBrowseDuration];
}

@end
