#pragma once

#import <AppKit/AppKit.h>

#include "platform/interface_file.h"

/// Represents an InterfaceOwner in AppKit, where the owner of an interface file must be an
/// Objective-C object. If the file binds the title of a control or window to a key of this object,
/// the title is the InterfaceOwner's text for that key.
@interface OnrampFileOwner : NSObject {
  onramp::InterfaceOwner* _owner;
  NSMutableSet* _boundKeys;
  NSWindow* _window;
}

/// `owner` must outlive this object.
- (instancetype)initWithOwner:(onramp::InterfaceOwner&)owner;

/// Returns the window that the file connects to the outlet "window", or nil if it connects none.
- (NSWindow*)window;
/// AppKit calls this function when it loads a file that connects the outlet "window".
- (void)setWindow:(NSWindow*)window;

@end
