// Makes small changes to GNUstep, so that it behaves like AppKit. The other files in this folder
// make larger changes.

#import "platform/cocoa/gnustep/appkit_additions.h"

#import "platform/cocoa/gnustep/method_exchange.h"

namespace {

using BeginSheet = void(id, SEL, NSWindow*, id, SEL, void*);
using PerformKey = BOOL(id, SEL, NSEvent*);

BeginSheet* originalBeginSheet = nullptr;
PerformKey* originalPerformKey = nullptr;

// Makes hidden buttons ignore their key equivalents, as in AppKit.
BOOL performKeyEquivalent(id self, SEL selector, NSEvent* event) {
  return ![self isHiddenOrHasHiddenAncestor] && originalPerformKey(self, selector, event);
}

// Implements two setters that GNUstep lacks. Neither needs to do anything: GNUstep shows no resize
// indicator on a window of fixed size, and no GNUstep window prevents termination.
void ignore(id, SEL, BOOL) {}

}  // namespace

/// A sheet that will open in the next iteration of the main loop. Retains the alert and the window.
@interface OnrampWaitingSheet : NSObject {
 @public
  NSAlert* _alert;
  NSWindow* _window;
  id _delegate;
  SEL _didEnd;
  BOOL _hasBegun;
}
@end

@implementation OnrampWaitingSheet

// The sheet's own loop may call this function a second time, because beginSheet() registers the
// call for two loop modes.
- (void)begin {
  if (_hasBegun) return;
  _hasBegun = YES;
  originalBeginSheet(_alert,
                     @selector(beginSheetModalForWindow:modalDelegate:didEndSelector:contextInfo:),
                     _window, _delegate, _didEnd, nullptr);
}

- (void)dealloc {
  [_alert release];
  [_window release];
  [super dealloc];
}

@end

namespace {

// Returns at once, as in AppKit, and opens the sheet in the next iteration of the main loop.
// GNUstep's own function runs a modal loop until the sheet closes, and only then returns.
void beginSheet(id self, SEL, NSWindow* window, id delegate, SEL didEnd, void*) {
  OnrampWaitingSheet* const sheet = [[[OnrampWaitingSheet alloc] init] autorelease];
  sheet->_alert = [self retain];
  sheet->_window = [window retain];
  sheet->_delegate = delegate;
  sheet->_didEnd = didEnd;
  [sheet performSelector:@selector(begin)
              withObject:nil
              afterDelay:0
                 inModes:[NSArray
                             arrayWithObjects:NSDefaultRunLoopMode, NSModalPanelRunLoopMode, nil]];
}

// Returns the size of a text field's text when it is wrapped to fit in `bounds`. For any other
// cell, returns the cell's usual size. GNUstep's own function returns the size of the text on a
// single line.
NSSize cellSizeForBounds(id self, SEL, NSRect bounds) {
  if (![self isKindOfClass:[NSTextFieldCell class]]) return [self cellSize];
  return [[self attributedStringValue] boundingRectWithSize:bounds.size
                                                    options:NSStringDrawingUsesLineFragmentOrigin]
      .size;
}

// Prevents GNUstep from starting its daemon for notifications between applications. The wizard does
// not use these notifications, and would fail to launch if the daemon were slow to answer.
id noDistributedCenter(id, SEL) {
  return nil;
}

// Opens `url` with xdg-open, because GNUstep's own function uses only GNUstep programs.
BOOL openURL(id, SEL, NSURL* url) {
  NSTask* const task = [[[NSTask alloc] init] autorelease];
  NSString* const address = [url isFileURL] ? [url path] : [url absoluteString];
  [task setLaunchPath:@"/usr/bin/env"];
  [task setArguments:[NSArray arrayWithObjects:@"xdg-open", address, nil]];
  @try {
    [task launch];
  } @catch (NSException*) {
    return NO;
  }
  return YES;
}

}  // namespace

/// Represents an accessibility relation between controls in an interface file. GNUstep creates an
/// object for each element of the file, and rejects the whole file if the class of any element
/// is missing.
@interface IBAccessibilityConnection : NSObject
@end

@implementation IBAccessibilityConnection

- (instancetype)initWithCoder:(NSCoder*)coder {
  return [super init];
}

@end

@interface OnrampAppKitAdditions : NSObject
@end

@implementation OnrampAppKitAdditions

+ (void)load {
  @autoreleasepool {
    using onramp::gnustep::replaceMethod;
    originalBeginSheet = replaceMethod(
        [NSAlert class],
        @selector(beginSheetModalForWindow:modalDelegate:didEndSelector:contextInfo:), beginSheet);
    originalPerformKey =
        replaceMethod([NSButton class], @selector(performKeyEquivalent:), performKeyEquivalent);
    replaceMethod([NSCell class], @selector(cellSizeForBounds:), cellSizeForBounds);
    replaceMethod([NSWorkspace class], @selector(openURL:), openURL);
    replaceMethod(object_getClass([NSDistributedNotificationCenter class]),
                  @selector(defaultCenter), noDistributedCenter);
    onramp::gnustep::addMethod([NSWindow class], @selector(setShowsResizeIndicator:), ignore);
    onramp::gnustep::addMethod([NSWindow class],
                               @selector(setPreventsApplicationTerminationWhenModal:), ignore);
    [NSButton exposeBinding:@"title"];
  }
}

@end
