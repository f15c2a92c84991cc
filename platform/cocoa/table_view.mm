#include "base/array_controller.h"
#import "platform/cocoa/native.h"
#import "platform/cocoa/retained.h"
#import "platform/cocoa/table_source.h"
#import "platform/cocoa/text.h"

namespace onramp {

using cocoa::nativeOf;
using cocoa::Retained;
using cocoa::toNSString;

// The controller's callbacks own the source, because the table does not retain it.
void TableView::bind(ArrayController& controller) const {
  NSTableView* const table = nativeOf<NSTableView>(*this);
  if (!table) return;
  const auto source =
      Retained<OnrampTableSource>::adopt([[OnrampTableSource alloc] initWithTable:table
                                                                       controller:controller]);
  controller.bind([source] { [source.get() reload]; }, [source] { [source.get() showSelection]; });
  [source.get() reload];
}

void TableView::setAllowsColumnReordering(bool allows) const {
  [nativeOf<NSTableView>(*this) setAllowsColumnReordering:allows];
}

void TableView::setAllowsColumnSelection(bool allows) const {
  [nativeOf<NSTableView>(*this) setAllowsColumnSelection:allows];
}

void TableView::setColumnHeader(std::string_view identifier, const std::string& title) const {
  NSTableView* const table = nativeOf<NSTableView>(*this);
  [[[table tableColumnWithIdentifier:toNSString(identifier)] headerCell]
      setStringValue:toNSString(title)];
  [[table headerView] setNeedsDisplay:YES];
  // Before bind(), the table has no source yet.
  if ([[table delegate] isKindOfClass:[OnrampTableSource class]]) {
    [static_cast<OnrampTableSource*>([table delegate]) fitColumns];
  }
}

void TableView::setColumnEditable(std::string_view identifier, bool editable) const {
  [[nativeOf<NSTableView>(*this) tableColumnWithIdentifier:toNSString(identifier)]
      setEditable:editable];
}

}  // namespace onramp
