// Tells a test which controls are on the screen, because GNUstep has no accessibility interface. A
// build with tests links this file into the application. gnustep_person.py asks for the controls
// and reads the answer.
//
// The environment variable ONRAMP_ACCESSIBILITY_FILE names the answer file. To ask, the test
// creates a question file, whose name is the answer file's name with ".question" appended. The
// application's main loop removes the question file and writes the answer file. The answer is a
// JSON array. Its first object describes the application, and has the keys "role" (with the value
// "application"), "name", "states" and "presses" (the number of left mouse button presses in its
// windows so far). Each of the remaining objects describes a visible window or control, and has the
// keys "role", "name", "states", "x", "y", "width" and "height". Roles and states have their AT-SPI
// names. The state "cut off", which AT-SPI lacks, marks text that does not fit. Lengths are in
// pixels, and x and y are measured from the screen's upper left corner.

#include <unistd.h>

#include <string>

#import "platform/cocoa/gnustep/appkit_additions.h"
#import "platform/cocoa/gnustep/method_exchange.h"
#import "platform/cocoa/text.h"

namespace {

constexpr NSTimeInterval kInterval = 0.02;  // seconds
constexpr CGFloat kUnlimited = 1e6;

using SendEvent = void(id, SEL, NSEvent*);

SendEvent* originalSendEvent = nullptr;
int presses = 0;

void sendEvent(id self, SEL selector, NSEvent* event) {
  if ([event type] == NSLeftMouseDown) ++presses;
  originalSendEvent(self, selector, event);
}

NSString* nameOf(NSPopUpButton* button) {
  return [[button toolTip] length] > 0 ? [button toolTip] : [button title];
}

// Describes one window and its controls.
class Reader {
 public:
  Reader(NSWindow* window, NSMutableArray* found) : window_(window), found_(found) {}

  void readWindow() {
    const bool isActive = [NSApp isActive] && [window_ isKeyWindow];
    NSView* const frame = [[window_ contentView] superview];
    add(@"frame", [window_ title], isActive ? [NSArray arrayWithObject:@"active"] : [NSArray array],
        frame, [frame bounds]);
    read(frame);
  }

 private:
  void read(NSView* view) {
    if ([view isHidden] || NSIsEmptyRect([view visibleRect])) return;
    if ([view isKindOfClass:[NSTableView class]]) {
      readTable(static_cast<NSTableView*>(view));
    } else if ([view isKindOfClass:[NSTableHeaderView class]]) {
      readHeader(static_cast<NSTableHeaderView*>(view));
    } else if ([view isKindOfClass:[NSMatrix class]]) {
      readMatrix(static_cast<NSMatrix*>(view));
    } else if ([view isKindOfClass:[NSMenuView class]]) {
      readMenu(static_cast<NSMenuView*>(view));
    } else {
      readControl(view);
      for (NSView* subview in [view subviews])
        read(subview);
    }
  }

  void readControl(NSView* view) {
    NSMutableArray* const states = [NSMutableArray array];
    const bool isControl = [view isKindOfClass:[NSControl class]];
    if (isControl && [static_cast<NSControl*>(view) isEnabled]) [states addObject:@"enabled"];
    if ([window_ firstResponder] == view) [states addObject:@"focused"];
    if ([view isKindOfClass:[NSPopUpButton class]]) {
      add(@"button menu", nameOf(static_cast<NSPopUpButton*>(view)), states, view, [view bounds]);
    } else if ([view isKindOfClass:[NSButton class]]) {
      checkRoom([static_cast<NSButton*>(view) cell], [view bounds], states);
      add(@"push button", [static_cast<NSButton*>(view) title], states, view, [view bounds]);
    } else if ([view isKindOfClass:[NSTextField class]]) {
      checkRoom([static_cast<NSTextField*>(view) cell], [view visibleRect], states);
      add(@"label", [static_cast<NSTextField*>(view) stringValue], states, view, [view bounds]);
    } else if ([view isKindOfClass:[NSTextView class]]) {
      add(@"label", [static_cast<NSTextView*>(view) string], states, view, [view bounds]);
    } else if ([view isKindOfClass:[NSProgressIndicator class]]) {
      add(@"progress bar", @"", states, view, [view bounds]);
    }
  }

  // Adds the state "cut off" if the text of `cell` does not fit into `room`. Skips texts in panels,
  // because GNUstep, not the wizard, lays them out.
  void checkRoom(NSCell* cell, NSRect room, NSMutableArray* states) {
    const NSSize needed = [cell cellSizeForBounds:NSMakeRect(0, 0, NSWidth(room), kUnlimited)];
    const bool fits = needed.width <= NSWidth(room) && needed.height <= NSHeight(room);
    if (!fits && ![window_ isKindOfClass:[NSPanel class]]) [states addObject:@"cut off"];
  }

  // Reports each visible cell: as a table cell if the table has headers, otherwise as a list item.
  void readTable(NSTableView* table) {
    NSString* const role = [table headerView] ? @"table cell" : @"list item";
    const NSRange rows = [table rowsInRect:[table visibleRect]];
    for (NSUInteger row = rows.location; row < NSMaxRange(rows); ++row) {
      NSMutableArray* const states = [NSMutableArray array];
      if ([table isEnabled]) [states addObject:@"enabled"];
      if ([table isRowSelected:static_cast<NSInteger>(row)]) {
        [states addObject:@"selected"];
        if ([window_ firstResponder] == table) [states addObject:@"focused"];
      }
      NSInteger column = 0;
      for (NSTableColumn* tableColumn in [table tableColumns]) {
        id const text = [[table dataSource] tableView:table
                            objectValueForTableColumn:tableColumn
                                                  row:static_cast<NSInteger>(row)];
        add(role, text, states, table,
            [table frameOfCellAtColumn:column++ row:static_cast<NSInteger>(row)]);
      }
    }
  }

  void readHeader(NSTableHeaderView* header) {
    NSInteger index = 0;
    for (NSTableColumn* column in [[header tableView] tableColumns]) {
      add(@"column header", [[column headerCell] stringValue], [NSArray array], header,
          [header headerRectOfColumn:index++]);
    }
  }

  void readMatrix(NSMatrix* matrix) {
    for (NSInteger row = 0; row < [matrix numberOfRows]; ++row) {
      NSButtonCell* const cell = [matrix cellAtRow:row column:0];
      NSMutableArray* const states = [NSMutableArray array];
      if ([matrix isEnabled] && [cell isEnabled]) [states addObject:@"enabled"];
      if ([cell state] == NSOnState) [states addObject:@"checked"];
      checkRoom(cell, [matrix cellFrameAtRow:row column:0], states);
      if ([window_ firstResponder] == matrix && [matrix selectedRow] == row) {
        [states addObject:@"focused"];
      }
      add(@"radio button", [cell title], states, matrix, [matrix cellFrameAtRow:row column:0]);
    }
  }

  void readMenu(NSMenuView* view) {
    NSInteger index = -1;
    for (NSMenuItem* item in [[view menu] itemArray]) {
      ++index;
      if ([item isSeparatorItem]) continue;
      NSMutableArray* const states = [NSMutableArray array];
      if ([item isEnabled]) [states addObject:@"enabled"];
      if ([view highlightedItemIndex] == index) [states addObject:@"selected"];
      add(@"menu item", [item title], states, view, [view rectOfItemAtIndex:index]);
    }
  }

  void add(NSString* role, NSString* name, NSArray* states, NSView* view, NSRect rect) {
    NSRect frame = [view convertRect:NSIntersectionRect(rect, [view visibleRect]) toView:nil];
    if (NSIsEmptyRect(frame)) return;
    frame.origin = [window_ convertBaseToScreen:frame.origin];
    const CGFloat screenHeight = NSMaxY([[NSScreen mainScreen] frame]);
    [found_ addObject:[NSDictionary
                          dictionaryWithObjectsAndKeys:role, @"role", name ? name : @"", @"name",
                                                       states, @"states", number(NSMinX(frame)),
                                                       @"x", number(screenHeight - NSMaxY(frame)),
                                                       @"y", number(NSWidth(frame)), @"width",
                                                       number(NSHeight(frame)), @"height", nil]];
  }

  static NSNumber* number(CGFloat value) {
    return [NSNumber numberWithLong:static_cast<long>(value)];
  }

  NSWindow* window_;
  NSMutableArray* found_;
};

}  // namespace

@interface OnrampAccessibility : NSObject {
  NSString* _answer;
  std::string _question;
}
@end

@implementation OnrampAccessibility

+ (void)load {
  @autoreleasepool {
    NSString* const path =
        [[[NSProcessInfo processInfo] environment] objectForKey:@"ONRAMP_ACCESSIBILITY_FILE"];
    if (!path) return;
    OnrampAccessibility* const writer = [[[OnrampAccessibility alloc] init] autorelease];
    writer->_answer = [path retain];
    writer->_question = onramp::cocoa::toStdString(path) + ".question";
    originalSendEvent =
        onramp::gnustep::replaceMethod([NSWindow class], @selector(sendEvent:), sendEvent);
    [[NSNotificationCenter defaultCenter] addObserver:[writer retain]
                                             selector:@selector(begin:)
                                                 name:NSApplicationWillFinishLaunchingNotification
                                               object:nil];
  }
}

- (void)begin:(NSNotification*)notification {
  NSTimer* const timer = [NSTimer timerWithTimeInterval:kInterval
                                                 target:self
                                               selector:@selector(answer:)
                                               userInfo:nil
                                                repeats:YES];
  for (NSString *mode in [NSArray arrayWithObjects:NSDefaultRunLoopMode, NSModalPanelRunLoopMode,
                                                   NSEventTrackingRunLoopMode, nil]) {
    [[NSRunLoop currentRunLoop] addTimer:timer forMode:mode];
  }
}

- (void)answer:(NSTimer*)timer {
  if (unlink(_question.c_str()) != 0) return;
  NSDictionary* const application =
      [NSDictionary dictionaryWithObjectsAndKeys:@"application", @"role",
                                                 [[NSProcessInfo processInfo] processName], @"name",
                                                 [NSArray array], @"states",
                                                 [NSNumber numberWithInt:presses], @"presses", nil];
  NSMutableArray* const found = [NSMutableArray arrayWithObject:application];
  for (NSWindow* window in [NSApp windows]) {
    if ([window isVisible]) Reader(window, found).readWindow();
  }
  [[NSJSONSerialization dataWithJSONObject:found options:0
                                     error:nullptr] writeToFile:_answer atomically:YES];
}

@end
