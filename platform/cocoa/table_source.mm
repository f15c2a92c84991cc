#import "platform/cocoa/table_source.h"

#include "base/array_controller.h"
#import "platform/cocoa/text.h"

@implementation OnrampTableSource

- (instancetype)initWithTable:(NSTableView*)table controller:(onramp::ArrayController&)controller {
  self = [super init];
  if (self) {
    _table = [table retain];
    _controller = &controller;
    [table setDataSource:self];
    [table setDelegate:self];
  }
  return self;
}

- (void)dealloc {
  [_table setDelegate:nil];
  [_table setDataSource:nil];
  [_table release];
  [super dealloc];
}

- (void)reload {
  _isShowingSelection = YES;
  [_table reloadData];
  [self showSelection];
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

// Follows the user's selection. When they deselect the row, it is selected again.
- (void)tableViewSelectionDidChange:(NSNotification*)notification {
  if (_isShowingSelection) return;
  const NSInteger row = [_table selectedRow];
  if (row < 0) {
    [self showSelection];
  } else {
    _controller->choose(static_cast<std::size_t>(row));
  }
}

@end
