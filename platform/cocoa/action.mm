#import "platform/cocoa/action.h"

#include <utility>

@implementation OnrampAction

+ (OnrampAction*)actionWithFunction:(std::function<void()>)function {
  OnrampAction* const action = [[[OnrampAction alloc] init] autorelease];
  action->_function = std::move(function);
  return action;
}

// Keeps this object alive during the call, because the function may release the last other
// reference to it.
- (void)perform:(id)sender {
  [[self retain] autorelease];
  _function();
}

@end
