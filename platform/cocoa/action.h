#pragma once

#import <Foundation/Foundation.h>

#include <functional>

/// Wraps a function as the target of controls, menu items, timers and messages between threads.
@interface OnrampAction : NSObject {
  std::function<void()> _function;
}

+ (OnrampAction*)actionWithFunction:(std::function<void()>)function;

- (void)perform:(id)sender;

@end
