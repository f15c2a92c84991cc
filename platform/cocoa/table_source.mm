#import "platform/cocoa/table_source.h"

#include <algorithm>
#include <cmath>

#include "base/array_controller.h"
#import "platform/cocoa/content_size.h"
#import "platform/cocoa/text.h"

namespace {

constexpr CGFloat kCellPadding = 6;  // points
constexpr NSUInteger kLeastNameLetters = 24;

// Returns the first enabled button in `view` that the Return key clicks, or nil if there is none.
// Skips hidden buttons, but not the buttons in hidden views.
NSButton* defaultButton(NSView* view) {
  if ([view isKindOfClass:[NSButton class]] && ![view isHidden]) {
    NSButton* const button = static_cast<NSButton*>(view);
    if ([[button keyEquivalent] isEqualToString:@"\r"] && [button isEnabled]) return button;
  }
  for (NSView* subview in [view subviews]) {
    if (NSButton* const found = defaultButton(subview)) return found;
  }
  return nil;
}

// Returns whether a word in `text` starts with `start`. Ignores case.
bool hasWordThatStarts(NSString* text, NSString* start) {
  NSCharacterSet* const letters = [NSCharacterSet alphanumericCharacterSet];
  NSRange rest = NSMakeRange(0, [text length]);
  while (rest.length > 0) {
    const NSRange found = [text rangeOfString:start options:NSCaseInsensitiveSearch range:rest];
    if (found.location == NSNotFound) return false;
    if (found.location == 0 ||
        ![letters characterIsMember:[text characterAtIndex:found.location - 1]]) {
      return true;
    }
    rest = NSMakeRange(found.location + 1, [text length] - found.location - 1);
  }
  return false;
}

CGFloat textWidth(NSCell* cell, NSString* text) {
  NSDictionary* const attributes = [NSDictionary dictionaryWithObject:[cell font]
                                                               forKey:NSFontAttributeName];
  return std::ceil([text sizeWithAttributes:attributes].width) + kCellPadding;
}

CGFloat headerWidth(NSTableColumn* column) {
  return std::ceil([[column headerCell] cellSize].width) + kCellPadding;
}

CGFloat leastNameWidth(NSCell* cell) {
  NSString* const letters = [@"" stringByPaddingToLength:kLeastNameLetters
                                              withString:@"n"
                                         startingAtIndex:0];
  return textWidth(cell, letters);
}

}  // namespace

@implementation OnrampTableSource

- (instancetype)initWithTable:(NSTableView*)table controller:(onramp::ArrayController&)controller {
  self = [super init];
  if (self) {
    _table = [table retain];
    _controller = &controller;
    [table setDataSource:self];
    [table setDelegate:self];
    [table setTarget:self];
    [table setAction:@selector(chooseRow:)];
    [table setDoubleAction:@selector(goOn:)];
  }
  return self;
}

- (void)dealloc {
  [_table setTarget:nil];
  [_table setDelegate:nil];
  [_table setDataSource:nil];
  [_table release];
  [super dealloc];
}

- (void)reload {
  _isShowingSelection = YES;
  [_table reloadData];
  [self fitColumns];
  [self showSelection];
}

// Makes every column except the first one at least as wide as its title and its texts. The first
// column shows names. If necessary, this column gets narrower, but not narrower than its title or
// 24 letters. If the table is still too narrow, makes the window wider. Does nothing if there is
// only one column.
- (void)fitColumns {
  NSArray* const columns = [_table tableColumns];
  if ([columns count] < 2) return;
  NSTableColumn* const first = [columns objectAtIndex:0];
  [first setMinWidth:std::max(leastNameWidth([first dataCell]), headerWidth(first))];
  CGFloat others = [_table intercellSpacing].width;
  for (NSTableColumn* column in columns) {
    if (column == first) continue;
    CGFloat width = headerWidth(column);
    for (NSInteger row = 0; row < [self numberOfRowsInTableView:_table]; ++row) {
      NSString* const text = [self tableView:_table objectValueForTableColumn:column row:row];
      width = std::max(width, textWidth([column dataCell], text));
    }
    [column setMinWidth:width];
    if (width > [column width]) [column setWidth:width];
    others += [column width] + [_table intercellSpacing].width;
  }
  onramp::cocoa::fitWindow([_table window]);
  const CGFloat room = [[_table enclosingScrollView] contentSize].width - others;
  if (room < [first width]) [first setWidth:std::max(room, [first minWidth])];
}

// A click on the row that is already selected also counts as a choice.
- (void)chooseRow:(id)sender {
  const NSInteger row = [_table clickedRow];
  if (row >= 0) _controller->choose(static_cast<std::size_t>(row));
}

// Clicks the default button after the table has handled the double-click, because the button's
// action can remove the table.
- (void)goOn:(id)sender {
  if ([_table clickedRow] < 0) return;
  [defaultButton([[_table window] contentView]) performSelector:@selector(performClick:)
                                                     withObject:nil
                                                     afterDelay:0];
}

- (void)showSelection {
  const auto selected = _controller->selectionIndex();
  _isShowingSelection = YES;
  if (selected) {
    const auto row = static_cast<NSUInteger>(*selected);
    [_table selectRowIndexes:[NSIndexSet indexSetWithIndex:row] byExtendingSelection:NO];
    [_table scrollRowToVisible:static_cast<NSInteger>(row)];
  } else {
    [_table deselectAll:nil];
  }
  _isShowingSelection = NO;
}

- (NSInteger)numberOfRowsInTableView:(NSTableView*)table {
  return static_cast<NSInteger>(_controller->arrangedObjects().size());
}

- (id)tableView:(NSTableView*)table
    objectValueForTableColumn:(NSTableColumn*)column
                          row:(NSInteger)row {
  const auto& entries = _controller->arrangedObjects();
  const auto index = static_cast<std::size_t>(row);
  if (index >= entries.size()) return @"";
  const std::string key = onramp::cocoa::toStdString([column identifier]);
  return onramp::cocoa::toNSString(entries[index].string(key).value_or(""));
}

// Searches from `startRow` to `endRow`, continuing at row 0 after the last row of the table.
// Returns the first row whose name has a word that starts with `typed`, or -1 if no row matches.
- (NSInteger)tableView:(NSTableView*)table
    nextTypeSelectMatchFromRow:(NSInteger)startRow
                         toRow:(NSInteger)endRow
                     forString:(NSString*)typed {
  NSTableColumn* const names = [[table tableColumns] objectAtIndex:0];
  const NSInteger count = [self numberOfRowsInTableView:table];
  for (NSInteger step = 0; step < count; ++step) {
    const NSInteger row = (startRow + step) % count;
    NSString* const name = [self tableView:table objectValueForTableColumn:names row:row];
    if (hasWordThatStarts(name, typed)) return row;
    if (row == endRow) break;
  }
  return -1;
}

// Passes the user's selection to the controller. If no row is selected now, selects the
// controller's row again.
- (void)tableViewSelectionDidChange:(NSNotification*)notification {
  if (_isShowingSelection) return;
  const NSInteger row = [_table selectedRow];
  if (row < 0) {
    [self showSelection];
  } else if (const auto index = static_cast<std::size_t>(row);
             index != _controller->selectionIndex()) {
    _controller->choose(index);
  }
}

@end
