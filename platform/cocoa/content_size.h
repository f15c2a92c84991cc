#pragma once

#import <AppKit/AppKit.h>

namespace onramp::cocoa {

/// Makes `window` as large as its contents need, up to the size of the screen. The window never
/// shrinks, and its middle stays in place as far as the screen allows. Call this after every change
/// of a text or of the visible views. Does nothing when `window` is nil or everything fits.
///
/// Text fields grow downwards if they hang on the top of the view that contains them, and upwards
/// if they stand on its bottom. A list beside them gets lower before the window gets higher. The
/// buttons directly inside the window's content view stand in a row, and their order in the
/// interface file is that from left to right.
void fitWindow(NSWindow* window);

}  // namespace onramp::cocoa
