#pragma once

#import <AppKit/AppKit.h>

namespace onramp::cocoa {

/// Makes `window` as large as its contents require, up to the size of the screen. The window never
/// shrinks, and its centre stays in place as far as the screen allows. Also arranges the contents,
/// as described below. Call this whenever text has changed or a view has been shown or hidden.
/// Does nothing when `window` is nil.
///
/// A text field that is too small for its text grows: downwards if it is attached to the top of its
/// superview, otherwise upwards. A list in the same superview makes room by getting shorter, down
/// to six rows. If that is not enough, the window gets taller. The buttons directly inside the
/// window's content view are laid out in a row. The interface file must list them from left to
/// right.
void fitWindow(NSWindow* window);

}  // namespace onramp::cocoa
