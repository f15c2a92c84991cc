#pragma once

#import <AppKit/AppKit.h>

#include "platform/interface_file.h"

/// Represents an InterfaceOwner to AppKit, which requires an object as the owner of an interface
/// file. A binding to any key of this object shows the InterfaceOwner's text under that key.
@interface OnrampFileOwner : NSObject {
  onramp::InterfaceOwner* _owner;
  NSMutableSet* _boundKeys;
  NSWindow* _window;
}

/// `owner` must outlive this object.
- (instancetype)initWithOwner:(onramp::InterfaceOwner&)owner;

/// The window that the file connects to the outlet "window"; nil when the file connects none.
- (NSWindow*)window;
- (void)setWindow:(NSWindow*)window;

@end
