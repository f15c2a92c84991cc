#pragma once

#import <AppKit/AppKit.h>

#include "platform/interface_file.h"

/// Stands for an InterfaceOwner towards an interface file: bindings to any key of it show the
/// owner's text under that key.
@interface OnrampFileOwner : NSObject {
  onramp::InterfaceOwner* _owner;
  NSMutableSet* _boundKeys;
  NSWindow* _window;
}

/// `owner` outlives the object.
- (instancetype)initWithOwner:(onramp::InterfaceOwner&)owner;

/// The window that the file connects to the outlet of this name; nil without one.
- (NSWindow*)window;
- (void)setWindow:(NSWindow*)window;

@end
