// While the first page is shown, makes macOS ask the user for permission to use the local network.
// macOS 15 and later ask when a program first uses the local network. Without this file, the device
// search would be the first use, and the search might end before the user has answered.

#import <AppKit/AppKit.h>

namespace {

constexpr NSTimeInterval kBrowseDuration = 1;  // seconds

}  // namespace

/// Starts a search for services when the application's first window becomes the main window, and
/// stops the search a second later. Ignores what the search finds.
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
  // macOS searches only for the service types that the information dictionary lists. For any other
  // type, macOS refuses without asking the user.
  NSArray* const types = [[NSBundle mainBundle] objectForInfoDictionaryKey:@"NSBonjourServices"];
  if ([types count] == 0) return;
  NSNetServiceBrowser* const browser = [[[NSNetServiceBrowser alloc] init] autorelease];
  [browser searchForServicesOfType:[types objectAtIndex:0] inDomain:@"local."];
  [browser performSelector:@selector(stop) withObject:nil afterDelay:kBrowseDuration];
}

@end
