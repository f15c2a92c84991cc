// Sets the user defaults that configure GNUstep.

#import "platform/cocoa/gnustep/appkit_additions.h"

namespace {

// The defaults domain that GNUstep searches first.
NSString* const kFirstDomain = @"GSPrimaryDomain";

// Returns the codes of the user's locale and language, such as "de_DE" and "de", and then "en". In
// our bundles, folders are named after codes, as in "de.lproj". By default, GNUstep looks for
// folders that are named after languages, as in "German.lproj".
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

// Sets the user's languages, puts the menu inside the window, and removes the application's icon
// from the desktop. Selects fonts with Chinese, Japanese and Korean characters, because GNUstep
// draws a question mark for a character that the font lacks. GNUstep ignores fonts that are not
// installed.
+ (void)load {
  @autoreleasepool {
    NSUserDefaults* const defaults = [NSUserDefaults standardUserDefaults];
    NSMutableDictionary* const options =
        [[[defaults volatileDomainForName:kFirstDomain] mutableCopy] autorelease];
    [options setObject:languageCodes() forKey:@"NSLanguages"];
    [options setObject:@"NSWindows95InterfaceStyle" forKey:@"NSMenuInterfaceStyle"];
    [options setObject:@"YES" forKey:@"GSSuppressAppIcon"];
    [options setObject:@"NotoSansCJKjp-Regular" forKey:@"NSFont"];
    [options setObject:@"NotoSansCJKjp-Bold" forKey:@"NSBoldFont"];
    [defaults removeVolatileDomainForName:kFirstDomain];
    [defaults setVolatileDomain:options forName:kFirstDomain];
  }
}

@end
