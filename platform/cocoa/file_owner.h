#pragma once

#import <AppKit/AppKit.h>

#include "platform/interface_file.h"

/// The file's owner in an interface file, in place of an InterfaceOwner. A binding to any of its
/// keys shows the InterfaceOwner's text under that key.
@interface OnrampFileOwner : NSObject {
  onramp::InterfaceOwner* _owner;
  NSMutableSet* _boundKeys;
  NSWindow* _window;
}

/// `owner` must outlive the object.
- (instancetype)initWithOwner:(onramp::InterfaceOwner&)owner;

/// The window that the file connects to the outlet "window"; nil when it connects none.
- (NSWindow*)window;
- (void)setWindow:(NSWindow*)window;

@end
