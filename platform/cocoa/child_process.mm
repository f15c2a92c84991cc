#include "platform/child_process.h"

#import "platform/cocoa/retained.h"
#import "platform/cocoa/text.h"

namespace onramp {

std::optional<int> runAndWait(const std::string& executable,
                              const std::vector<std::string>& arguments) {
  const auto task = cocoa::Retained<NSTask>::adopt([[NSTask alloc] init]);
  NSMutableArray* const texts = [NSMutableArray array];
  for (const std::string& argument : arguments)
    [texts addObject:cocoa::toNSString(argument)];
  [task.get() setLaunchPath:cocoa::toNSString(executable)];
  [task.get() setArguments:texts];
  @try {
    [task.get() launch];
  } @catch (NSException*) {
    return std::nullopt;
  }
  [task.get() waitUntilExit];
  if ([task.get() terminationReason] != NSTaskTerminationReasonExit) return std::nullopt;
  return [task.get() terminationStatus];
}

}  // namespace onramp
