#include "platform/folders.h"

#import "platform/cocoa/text.h"

namespace onramp {

std::string applicationSupportFolder(FolderDomain domain) {
  const NSSearchPathDomainMask mask =
      domain == FolderDomain::kUser ? NSUserDomainMask : NSLocalDomainMask;
  NSArray* const folders =
      NSSearchPathForDirectoriesInDomains(NSApplicationSupportDirectory, mask, YES);
  if ([folders count] == 0) return "";
  NSString* const folder = [folders objectAtIndex:0];
  [[NSFileManager defaultManager] createDirectoryAtPath:folder
                            withIntermediateDirectories:YES
                                             attributes:nil
                                                  error:nullptr];
  return cocoa::toStdString(folder);
}

}  // namespace onramp
