#pragma once

#import <AppKit/AppKit.h>

namespace onramp {
class ArrayController;
}

/// Shows an array controller's entries in a table, and keeps the selections of the table and of the
/// controller in sync. A double-click on a row clicks the window's default button.
@interface OnrampTableSource : NSObject <NSTableViewDataSource, NSTableViewDelegate> {
  NSTableView* _table;
  onramp::ArrayController* _controller;
  BOOL _isShowingSelection;
}

/// Retains `table`. `controller` must outlive this object.
- (instancetype)initWithTable:(NSTableView*)table controller:(onramp::ArrayController&)controller;

/// Call this when the controller's entries have changed.
- (void)reload;

/// Call this when the title of a column has changed.
- (void)fitColumns;

/// Call this when the controller's selection has changed.
- (void)showSelection;

@end
