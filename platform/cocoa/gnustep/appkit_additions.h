#pragma once

#ifdef __OBJC__

#import <AppKit/AppKit.h>

// Declares what the front end uses of AppKit and GNUstep lacks. Included ahead of every source.

@interface NSView (OnrampIdentification)
- (NSString*)identifier;
- (void)setIdentifier:(NSString*)identifier;
- (void)setAccessibilityLabel:(NSString*)label;
@end

@interface NSWindow (OnrampTermination)
- (void)setPreventsApplicationTerminationWhenModal:(BOOL)prevents;
@end

#endif
