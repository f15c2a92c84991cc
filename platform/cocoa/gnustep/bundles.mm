// Makes GNUstep read bundles that are laid out as on macOS, where the folder "Contents" holds
// everything.

#import "platform/cocoa/gnustep/appkit_additions.h"
#import "platform/cocoa/gnustep/method_exchange.h"

namespace {

NSString* const kContents = @"Contents";

using ResourcePaths = NSArray*(id, SEL, NSString*, NSString*, NSString*);
using PathGetter = NSString*(id, SEL);

ResourcePaths* originalResourcePaths = nullptr;
PathGetter* originalExecutablePath = nullptr;

bool isFolder(NSString* path) {
  BOOL isDirectory = NO;
  return [[NSFileManager defaultManager] fileExistsAtPath:path isDirectory:&isDirectory] &&
         isDirectory;
}

NSString* contentsOf(NSString* bundlePath) {
  NSString* const contents = [bundlePath stringByAppendingPathComponent:kContents];
  return isFolder(contents) ? contents : bundlePath;
}

// Returns the folder for the user's first language, or nil if the bundle lacks that folder.
// GNUstep's own search misses "zh_CN.lproj", because it looks for names such as
// "SimplifiedChinese.lproj".
NSString* firstLanguageFolder(NSString* rootPath, NSString* subPath) {
  NSArray* const languages =
      [[NSUserDefaults standardUserDefaults] stringArrayForKey:@"NSLanguages"];
  NSString* const folder = [[[[rootPath stringByAppendingPathComponent:@"Resources"]
      stringByAppendingPathComponent:subPath ? subPath : @""]
      stringByAppendingPathComponent:[languages objectAtIndex:0]]
      stringByAppendingPathExtension:@"lproj"];
  return isFolder(folder) ? folder : nil;
}

NSArray* resourcePaths(id self, SEL selector, NSString* rootPath, NSString* subPath,
                       NSString* localization) {
  NSString* const contents = contentsOf(rootPath);
  NSArray* const paths = originalResourcePaths(self, selector, contents, subPath, localization);
  NSString* const first = localization ? nil : firstLanguageFolder(contents, subPath);
  if (!first || [paths count] == 0) return paths;
  NSMutableArray* const all = [NSMutableArray arrayWithArray:paths];
  [all insertObject:first atIndex:1];  // after the folder of resources without a language
  return all;
}

NSString* resourcePath(id self, SEL) {
  return [contentsOf([self bundlePath]) stringByAppendingPathComponent:@"Resources"];
}

NSString* executablePath(id self, SEL selector) {
  NSString* const contents = contentsOf([self bundlePath]);
  NSString* const name = [[self infoDictionary] objectForKey:@"CFBundleExecutable"];
  for (NSString *system in [NSArray arrayWithObjects:@"Linux", @"MacOS", nil]) {
    NSString* const folder = [contents stringByAppendingPathComponent:system];
    if (name && isFolder(folder)) return [folder stringByAppendingPathComponent:name];
  }
  return originalExecutablePath(self, selector);
}

// Returns the bundle whose folder Contents/Linux contains the running program.
NSBundle* mainBundle(id, SEL) {
  static NSBundle* bundle = nil;
  if (!bundle) {
    NSString* path =
        [[NSFileManager defaultManager] pathContentOfSymbolicLinkAtPath:@"/proc/self/exe"];
    for (int level = 0; level < 3; ++level)
      path = [path stringByDeletingLastPathComponent];
    bundle = [[NSBundle alloc] initWithPath:path];
  }
  return bundle;
}

}  // namespace

@interface OnrampBundles : NSObject
@end

@implementation OnrampBundles

+ (void)load {
  @autoreleasepool {
    using onramp::gnustep::replaceMethod;
    Class const bundle = [NSBundle class];
    originalResourcePaths = replaceMethod(
        object_getClass(bundle), @selector(_bundleResourcePathsWithRootPath:subPath:localization:),
        resourcePaths);
    replaceMethod(bundle, @selector(resourcePath), resourcePath);
    originalExecutablePath = replaceMethod(bundle, @selector(executablePath), executablePath);
    replaceMethod(object_getClass(bundle), @selector(mainBundle), mainBundle);
  }
}

@end
