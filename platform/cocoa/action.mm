#import "platform/cocoa/action.h"

#include <utility>

@implementation OnrampAction

+ (OnrampAction*)actionWithFunction:(std::function<void()>)function {
  OnrampAction* const action = [[[OnrampAction alloc] init] autorelease];
  action->_function = std::move(function);
  return action;
}

// The function may release the last reference to this object, so the object retains itself during
// the call.
- (void)perform:(id)sender {
  [[self retain] autorelease];
  _function();
}

@end
