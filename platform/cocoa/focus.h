#pragma once

#import <AppKit/AppKit.h>

namespace onramp::cocoa {

/// Gives the keyboard focus to the first list in `view`, or to the first control if there is no
/// list. Skips lists and controls that do not accept the focus. Does nothing if no list or control
/// accepts the focus, or if `view` is in no window.
void focusFirstControl(NSView* view);

}  // namespace onramp::cocoa
