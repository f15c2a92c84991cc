#pragma once

#ifdef __OBJC__

#import <AppKit/AppKit.h>

// Declares the AppKit methods that the front end uses but GNUstep's headers lack.

@interface NSView (OnrampIdentification)
- (NSString*)identifier;
- (void)setIdentifier:(NSString*)identifier;
- (void)setAccessibilityLabel:(NSString*)label;
- (void)setAccessibilityRole:(NSString*)role;
@end

@interface NSCell (OnrampAccessibility)
- (void)setAccessibilityElement:(BOOL)isElement;
@end

@interface NSWindow (OnrampTermination)
- (void)setPreventsApplicationTerminationWhenModal:(BOOL)prevents;
@end

#endif
