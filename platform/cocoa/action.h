#pragma once

#import <Foundation/Foundation.h>

#include <functional>

/// Holds a function. An object of this class can be the target of a control, a menu item, a timer
/// or performSelectorOnMainThread:. Each of them calls the function through perform:.
@interface OnrampAction : NSObject {
  std::function<void()> _function;
}

/// Returns an autoreleased object that holds `function`, which must not be empty.
+ (OnrampAction*)actionWithFunction:(std::function<void()>)function;

/// Calls the function. Ignores `sender`.
- (void)perform:(id)sender;

@end
