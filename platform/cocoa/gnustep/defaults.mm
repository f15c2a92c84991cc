// How GNUstep is to behave, as it looks it up itself.

#import "platform/cocoa/gnustep/appkit_additions.h"

namespace {

// What is looked up before everything else.
NSString* const kFirstDomain = @"GSPrimaryDomain";

// GNUstep looks for folders named after languages; those of a bundle are named after their codes.
NSArray* languageCodes() {
  NSDictionary* const environment = [[NSProcessInfo processInfo] environment];
  NSMutableArray* const codes = [NSMutableArray array];
  for (NSString *variable in
       [NSArray arrayWithObjects:@"LANGUAGE", @"LC_ALL", @"LC_MESSAGES", @"LANG", nil]) {
    NSString* const locale =
        [[[environment objectForKey:variable] componentsSeparatedByString:@"."] objectAtIndex:0];
    if ([locale length] == 0) continue;
    [codes addObject:locale];
    [codes addObject:[[locale componentsSeparatedByString:@"_"] objectAtIndex:0]];
    break;
  }
  [codes addObject:@"en"];
  return codes;
}

}  // namespace

@interface OnrampDefaults : NSObject
@end

@implementation OnrampDefaults

// The menu lies in the window, and there is no icon on the desktop.
+ (void)load {
  @autoreleasepool {
    NSUserDefaults* const defaults = [NSUserDefaults standardUserDefaults];
    NSMutableDictionary* const options =
        [[[defaults volatileDomainForName:kFirstDomain] mutableCopy] autorelease];
    [options setObject:languageCodes() forKey:@"NSLanguages"];
    [options setObject:@"NSWindows95InterfaceStyle" forKey:@"NSMenuInterfaceStyle"];
    [options setObject:@"YES" forKey:@"GSSuppressAppIcon"];
    [defaults removeVolatileDomainForName:kFirstDomain];
    [defaults setVolatileDomain:options forName:kFirstDomain];
  }
}

@end
