#pragma once

#import <AppKit/AppKit.h>

#include "platform/interface_file.h"

/// Represents an InterfaceOwner to AppKit, which accepts only an Objective-C object as the owner of
/// an interface file. If the file binds a control to a key of this object, the control shows the
/// InterfaceOwner's text under that key.
@interface OnrampFileOwner : NSObject {
  onramp::InterfaceOwner* _owner;
  NSMutableSet* _boundKeys;
  NSWindow* _window;
}

/// `owner` must outlive this object.
- (instancetype)initWithOwner:(onramp::InterfaceOwner&)owner;

/// Returns the window that the file connects to the outlet "window", or nil when the file connects
/// none.
- (NSWindow*)window;
/// AppKit calls this function when it loads a file that connects the outlet.
- (void)setWindow:(NSWindow*)window;

@end
