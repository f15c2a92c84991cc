#include "platform/lowercase.h"

#import "platform/cocoa/text.h"

namespace onramp {

std::string lowercaseString(const std::string& text) {
  return cocoa::toStdString([cocoa::toNSString(text) lowercaseString]);
}

}  // namespace onramp
