#pragma once

#import <Foundation/Foundation.h>

#include <string>
#include <string_view>

namespace onramp::cocoa {

/// Converts `text` to an NSString. The result is empty when `text` is not valid UTF-8.
[[nodiscard]] inline NSString* toNSString(std::string_view text) {
  NSString* const string = [[NSString alloc] initWithBytes:text.data()
                                                    length:text.size()
                                                  encoding:NSUTF8StringEncoding];
  return string ? [string autorelease] : @"";
}

/// Converts `string` to UTF-8. The result is empty when `string` is nil or cannot be converted.
[[nodiscard]] inline std::string toStdString(NSString* string) {
  NSData* const bytes = [string dataUsingEncoding:NSUTF8StringEncoding];
  return bytes ? std::string(static_cast<const char*>([bytes bytes]), [bytes length]) : "";
}

}  // namespace onramp::cocoa
