#include "platform/workspace.h"

#import <AppKit/AppKit.h>

#import "platform/cocoa/text.h"

namespace onramp {

bool openFile(const std::string& path) {
  NSURL* const url = [NSURL fileURLWithPath:cocoa::toNSString(path)];
  return [[NSWorkspace sharedWorkspace] openURL:url];
}

bool openURL(const std::string& url) {
  NSURL* const address = [NSURL URLWithString:cocoa::toNSString(url)];
  return address && [[NSWorkspace sharedWorkspace] openURL:address];
}

}  // namespace onramp
