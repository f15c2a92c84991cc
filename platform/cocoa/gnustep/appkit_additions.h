#pragma once

#ifdef __OBJC__

#import <AppKit/AppKit.h>

// Declares the AppKit methods that the front end and its interface files use but GNUstep lacks.

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
