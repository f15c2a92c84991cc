#pragma once

#import <AppKit/AppKit.h>

namespace onramp {
class ArrayController;
}

/// Shows an array controller's entries in a table and keeps both selections the same, for as long
/// as it lives.
@interface OnrampTableSource : NSObject <NSTableViewDataSource, NSTableViewDelegate> {
  NSTableView* _table;
  onramp::ArrayController* _controller;
  BOOL _isShowingSelection;
}

/// Keeps `table`; `controller` outlives the object.
- (instancetype)initWithTable:(NSTableView*)table controller:(onramp::ArrayController&)controller;

/// The controller's entries have changed.
- (void)reload;

/// The controller's selection has changed.
- (void)showSelection;

@end
