#pragma once

#import <AppKit/AppKit.h>

namespace onramp {
class ArrayController;
}

/// Shows an array controller's entries in a table and keeps the two selections equal. A
/// double-click on a row does what the window's default button does.
@interface OnrampTableSource : NSObject <NSTableViewDataSource, NSTableViewDelegate> {
  NSTableView* _table;
  onramp::ArrayController* _controller;
  BOOL _isShowingSelection;
}

/// Retains `table`; `controller` must outlive the object.
- (instancetype)initWithTable:(NSTableView*)table controller:(onramp::ArrayController&)controller;

/// Call when the controller's entries have changed.
- (void)reload;

/// Call when the controller's selection has changed.
- (void)showSelection;

@end
