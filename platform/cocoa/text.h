#pragma once

#import <Foundation/Foundation.h>

#include <string>
#include <string_view>

namespace onramp::cocoa {

/// `text` as a string object; empty when it is not valid UTF-8.
[[nodiscard]] inline NSString* toNSString(std::string_view text) {
  NSString* const string = [[NSString alloc] initWithBytes:text.data()
                                                    length:text.size()
                                                  encoding:NSUTF8StringEncoding];
  return string ? [string autorelease] : @"";
}

/// `string` in UTF-8; empty for nil.
[[nodiscard]] inline std::string toStdString(NSString* string) {
  NSData* const bytes = [string dataUsingEncoding:NSUTF8StringEncoding];
  return bytes ? std::string(static_cast<const char*>([bytes bytes]), [bytes length]) : "";
}

}  // namespace onramp::cocoa
