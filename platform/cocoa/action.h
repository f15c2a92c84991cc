#pragma once

#import <Foundation/Foundation.h>

#include <functional>

/// Wraps a function in an object, so that controls, menu items, timers and messages between threads
/// can call it.
@interface OnrampAction : NSObject {
  std::function<void()> _function;
}

+ (OnrampAction*)actionWithFunction:(std::function<void()>)function;

- (void)perform:(id)sender;

@end
