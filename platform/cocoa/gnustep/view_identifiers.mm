// Gives each view its identifier from the interface file. GNUstep ignores these identifiers.

#import "platform/cocoa/gnustep/appkit_additions.h"
#import "platform/cocoa/gnustep/method_exchange.h"

namespace {

using InitWithCoder = id(id, SEL, NSCoder*);
using Dealloc = void(id, SEL);

InitWithCoder* originalViewInit = nullptr;
InitWithCoder* originalCustomViewInit = nullptr;
Dealloc* originalDealloc = nullptr;

// Returns the table that maps each view to its identifier. When a view is deallocated, dealloc()
// removes the view from the table.
NSMapTable* identifiers() {
  static NSMapTable* const table =
      NSCreateMapTable(NSNonOwnedPointerMapKeyCallBacks, NSObjectMapValueCallBacks, 64);
  return table;
}

id identified(id view, NSCoder* coder) {
  if ([coder allowsKeyedCoding] && [coder containsValueForKey:@"identifier"]) {
    [view setIdentifier:[coder decodeObjectForKey:@"identifier"]];
  }
  return view;
}

id viewInit(id self, SEL selector, NSCoder* coder) {
  return identified(originalViewInit(self, selector, coder), coder);
}

// When an NSCustomView is decoded, the result is not `self` but a view of the custom class.
id customViewInit(id self, SEL selector, NSCoder* coder) {
  return identified(originalCustomViewInit(self, selector, coder), coder);
}

void dealloc(id self, SEL selector) {
  NSMapRemove(identifiers(), self);
  originalDealloc(self, selector);
}

}  // namespace

@implementation NSView (OnrampIdentification)

- (NSString*)identifier {
  return static_cast<NSString*>(NSMapGet(identifiers(), self));
}

- (void)setIdentifier:(NSString*)identifier {
  if (identifier) {
    NSMapInsert(identifiers(), self, identifier);
  } else {
    NSMapRemove(identifiers(), self);
  }
}

// The setters for accessibility do nothing, because GNUstep does not support accessibility.

- (void)setAccessibilityLabel:(NSString*)label {
}

- (void)setAccessibilityRole:(NSString*)role {
}

@end

@implementation NSCell (OnrampAccessibility)

- (void)setAccessibilityElement:(BOOL)isElement {
}

@end

@interface OnrampViewIdentifiers : NSObject
@end

@implementation OnrampViewIdentifiers

+ (void)load {
  using onramp::gnustep::replaceMethod;
  originalViewInit = replaceMethod([NSView class], @selector(initWithCoder:), viewInit);
  originalCustomViewInit =
      replaceMethod(NSClassFromString(@"NSCustomView"), @selector(initWithCoder:), customViewInit);
  originalDealloc = replaceMethod([NSView class], @selector(dealloc), dealloc);
}

@end
