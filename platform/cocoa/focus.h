#pragma once

#import <AppKit/AppKit.h>

namespace onramp::cocoa {

/// Gives the keyboard focus to the first list in `view`, or to the first control if there is no
/// list. Searches the subviews in their order. Leaves the focus as it is if no control accepts the
/// focus.
void focusFirstControl(NSView* view);

}  // namespace onramp::cocoa
