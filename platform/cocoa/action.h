#pragma once

#import <Foundation/Foundation.h>

#include <functional>

/// Holds a function, which perform: calls. So an object of this class can be the target of a
/// button, a menu item or a timer.
@interface OnrampAction : NSObject {
  std::function<void()> _function;
}

/// Returns an autoreleased object that holds `function`, which must not be empty.
+ (OnrampAction*)actionWithFunction:(std::function<void()>)function;

/// Calls the function. Ignores `sender`.
- (void)perform:(id)sender;

@end
