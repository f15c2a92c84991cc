#pragma once

#import <Foundation/Foundation.h>

#include <functional>

/// Holds a function that a button, a menu item or a timer calls through perform:.
@interface OnrampAction : NSObject {
  std::function<void()> _function;
}

/// Returns an autoreleased object that holds `function`, which must not be empty.
+ (OnrampAction*)actionWithFunction:(std::function<void()>)function;

/// Calls the function. Ignores `sender`.
- (void)perform:(id)sender;

@end
