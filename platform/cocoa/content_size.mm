#import "platform/cocoa/content_size.h"

#include <algorithm>
#include <cmath>

namespace onramp::cocoa {

namespace {

// All lengths are in points.
constexpr CGFloat kUnlimited = 1e6;
constexpr CGFloat kRoomBesideTitle = 10;
constexpr CGFloat kButtonGap = -2;  // AppKit draws a push button smaller than its frame
constexpr CGFloat kLeastGap = 8;    // between the views at the top and the views at the bottom
constexpr CGFloat kScrollerRoom = 20;
constexpr NSInteger kLeastRows = 6;

bool hangsOnTop(NSView* view) {
  return ([view autoresizingMask] & (NSViewMinYMargin | NSViewHeightSizable)) == NSViewMinYMargin;
}

bool fillsHeight(NSView* view) {
  return ([view autoresizingMask] & NSViewHeightSizable) != 0;
}

// Returns whether fitWindow() lays out the views inside `view`. Controls and scroll views lay out
// their contents themselves.
bool isContainer(NSView* view) {
  return ![view isKindOfClass:[NSControl class]] && ![view isKindOfClass:[NSScrollView class]];
}

// Moves or resizes `view`, and redraws its superview. Does nothing if `view` already has this
// frame.
void setFrame(NSView* view, NSRect frame) {
  if (NSEqualRects(frame, [view frame])) return;
  [view setFrame:frame];
  [[view superview] setNeedsDisplay:YES];
}

// The buttons in the row at the bottom of the window, from left to right.
class ButtonRow {
 public:
  explicit ButtonRow(NSView* content) : content_(content) {}

  /// Returns how much wider the content view must be for the visible buttons. The result is
  /// negative if the view is wider than necessary.
  [[nodiscard]] CGFloat missingWidth() const {
    CGFloat needed = leftEdge() + NSWidth([content_ bounds]) - rightEdge();
    CGFloat gap = 0;
    for (NSView* view in [content_ subviews]) {
      if (!isVisibleButton(view)) continue;
      needed += gap + neededWidth(view);
      gap = kButtonGap;
    }
    return needed - NSWidth([content_ bounds]);
  }

  /// Places the visible buttons side by side. The last button that is attached to the right ends at
  /// the row's right edge, and the first of the others starts at the row's left edge.
  void layOut() const {
    CGFloat left = leftEdge();
    CGFloat right = rightEdge();
    for (NSView* view in [content_ subviews]) {
      if (!isVisibleButton(view) || standsRight(view)) continue;
      place(view, left);
      left = NSMaxX([view frame]) + kButtonGap;
    }
    for (NSView* view in [[content_ subviews] reverseObjectEnumerator]) {
      if (!isVisibleButton(view) || !standsRight(view)) continue;
      place(view, right - neededWidth(view));
      right = NSMinX([view frame]) - kButtonGap;
    }
  }

 private:
  static bool isButton(NSView* view) { return [view isKindOfClass:[NSButton class]]; }
  static bool isVisibleButton(NSView* view) { return isButton(view) && ![view isHidden]; }
  static bool standsRight(NSView* view) {
    return ([view autoresizingMask] & NSViewMinXMargin) != 0;
  }

  static CGFloat neededWidth(NSView* button) {
    const CGFloat title = [[static_cast<NSButton*>(button) cell] cellSize].width;
    return std::max(std::ceil(title) + 2 * kRoomBesideTitle, NSWidth([button frame]));
  }

  static void place(NSView* button, CGFloat x) {
    NSRect frame = [button frame];
    frame.origin.x = x;
    frame.size.width = neededWidth(button);
    setFrame(button, frame);
  }

  // The outermost buttons mark the edges of the row, even if they are hidden.
  [[nodiscard]] CGFloat leftEdge() const {
    CGFloat edge = NSWidth([content_ bounds]);
    for (NSView* view in [content_ subviews]) {
      if (isButton(view) && !standsRight(view)) edge = std::min(edge, NSMinX([view frame]));
    }
    return edge;
  }

  [[nodiscard]] CGFloat rightEdge() const {
    CGFloat edge = 0;
    for (NSView* view in [content_ subviews]) {
      if (isButton(view) && standsRight(view)) edge = std::max(edge, NSMaxX([view frame]));
    }
    return edge;
  }

  NSView* content_;
};

// Returns the width that `matrix`, which has one column, needs for its cells.
CGFloat neededWidth(NSMatrix* matrix) {
  CGFloat width = 0;
  for (NSCell* cell in [matrix cells])
    width = std::max(width, std::ceil([cell cellSize].width));
  return width;
}

// Returns the width that `list` needs for its scroller and for its columns at their minimum widths.
CGFloat neededWidth(NSTableView* list) {
  CGFloat width = kScrollerRoom;
  for (NSTableColumn* column in [list tableColumns])
    width += [column minWidth] + [list intercellSpacing].width;
  return width;
}

// Returns how much wider `view` must be so that every list and radio matrix in it fits. The result
// can be negative if `view` itself is a matrix or the scroll view of a list.
CGFloat missingWidth(NSView* view) {
  if ([view isKindOfClass:[NSMatrix class]]) {
    return neededWidth(static_cast<NSMatrix*>(view)) - NSWidth([view frame]);
  }
  if ([view isKindOfClass:[NSScrollView class]]) {
    NSView* const list = [static_cast<NSScrollView*>(view) documentView];
    if (![list isKindOfClass:[NSTableView class]]) return 0;
    return neededWidth(static_cast<NSTableView*>(list)) - NSWidth([view frame]);
  }
  CGFloat missing = 0;
  if (!isContainer(view)) return missing;
  for (NSView* subview in [view subviews])
    missing = std::max(missing, missingWidth(subview));
  return missing;
}

// Makes the cells of each matrix as wide as the matrix. The interface files do not let AppKit
// resize the cells, because AppKit would also change their height.
void widenCells(NSView* view) {
  if ([view isKindOfClass:[NSMatrix class]]) {
    NSMatrix* const matrix = static_cast<NSMatrix*>(view);
    const NSSize size = NSMakeSize(NSWidth([matrix frame]), [matrix cellSize].height);
    if (size.width != [matrix cellSize].width) [matrix setCellSize:size];
  } else if (isContainer(view)) {
    for (NSView* subview in [view subviews])
      widenCells(subview);
  }
}

// Returns how much taller a text field must be to show its text, or 0 for any other view.
CGFloat missingHeight(NSView* view) {
  if (![view isKindOfClass:[NSTextField class]]) return 0;
  const NSRect bounds = NSMakeRect(0, 0, NSWidth([view frame]), kUnlimited);
  const NSSize needed = [[static_cast<NSTextField*>(view) cell] cellSizeForBounds:bounds];
  return std::max(std::ceil(needed.height) - NSHeight([view frame]), CGFloat{0});
}

CGFloat leastHeight(NSView* view) {
  if (![view isKindOfClass:[NSScrollView class]]) return 0;
  NSView* const document = [static_cast<NSScrollView*>(view) documentView];
  if (![document isKindOfClass:[NSTableView class]]) return 0;
  NSTableView* const list = static_cast<NSTableView*>(document);
  const NSInteger rows = kLeastRows + ([list headerView] ? 1 : 0);
  return static_cast<CGFloat>(rows) * ([list rowHeight] + [list intercellSpacing].height);
}

// Returns how much taller the text fields in `parent` can get before `parent` must get taller, too.
CGFloat spareHeight(NSView* parent) {
  CGFloat lowestOnTop = NSHeight([parent bounds]);
  CGFloat highestOnBottom = 0;
  for (NSView* view in [parent subviews]) {
    if (fillsHeight(view)) return NSHeight([view frame]) - leastHeight(view);
    if (hangsOnTop(view)) {
      lowestOnTop = std::min(lowestOnTop, NSMinY([view frame]));
    } else {
      highestOnBottom = std::max(highestOnBottom, NSMaxY([view frame]));
    }
  }
  return lowestOnTop - highestOnBottom - kLeastGap;
}

// Returns how much taller `view` must be for the text fields inside it.
CGFloat missingHeightInside(NSView* view) {
  if (!isContainer(view)) return 0;
  CGFloat missingHere = 0;
  CGFloat missing = 0;
  for (NSView* subview in [view subviews]) {
    missingHere += missingHeight(subview);
    missing = std::max(missing, missingHeightInside(subview));
  }
  return missingHere > 0 ? std::max(missing, missingHere - spareHeight(view)) : missing;
}

// Makes a text field taller by `height`, and moves or shortens the views in `parent` that are in
// the way.
void grow(NSView* field, CGFloat height, NSView* parent) {
  const NSRect old = [field frame];
  const bool isOnTop = hangsOnTop(field);
  const CGFloat bottom = NSMinY(old) - (isOnTop ? height : 0);
  setFrame(field, NSMakeRect(NSMinX(old), bottom, NSWidth(old), NSHeight(old) + height));
  for (NSView* view in [parent subviews]) {
    NSRect frame = [view frame];
    const bool isInTheWay = isOnTop ? NSMaxY(frame) <= NSMinY(old) : NSMinY(frame) >= NSMaxY(old);
    if (view == field || !isInTheWay) continue;
    if (fillsHeight(view)) frame.size.height = std::max(NSHeight(frame) - height, CGFloat{0});
    if (isOnTop && hangsOnTop(view)) frame.origin.y -= height;
    if (!isOnTop && !hangsOnTop(view)) frame.origin.y += height;
    setFrame(view, frame);
  }
}

void growFields(NSView* view) {
  if (!isContainer(view)) return;
  for (NSView* subview in [view subviews]) {
    if (const CGFloat missing = missingHeight(subview); missing > 0) grow(subview, missing, view);
    growFields(subview);
  }
}

// Returns where one side of a window must start so that the side lies between `least` and
// `greatest`, as close as possible to `start`. `length` is the length of the side. If the side is
// too long, returns `least`.
CGFloat startWithin(CGFloat least, CGFloat greatest, CGFloat start, CGFloat length) {
  return std::max(least, std::min(std::floor(start), greatest - length));
}

// Enlarges a window by `width` and `height`, but not beyond the size of the screen. Treats negative
// lengths as 0. Keeps the window's middle in place as far as possible.
void enlarge(NSWindow* window, CGFloat width, CGFloat height) {
  NSScreen* const screen = [window screen] ? [window screen] : [NSScreen mainScreen];
  const NSRect bounds = [screen visibleFrame];
  const NSRect old = [window frame];
  width = std::clamp(width, CGFloat{0}, std::max(NSWidth(bounds) - NSWidth(old), CGFloat{0}));
  height = std::clamp(height, CGFloat{0}, std::max(NSHeight(bounds) - NSHeight(old), CGFloat{0}));
  if (width == 0 && height == 0) return;
  NSRect frame = NSInsetRect(old, -width / 2, -height / 2);
  frame.origin.x = startWithin(NSMinX(bounds), NSMaxX(bounds), NSMinX(frame), NSWidth(frame));
  frame.origin.y = startWithin(NSMinY(bounds), NSMaxY(bounds), NSMinY(frame), NSHeight(frame));
  [window setFrame:frame display:NO];
}

}  // namespace

// Sets the width first, because the height of wrapped text depends on it.
void fitWindow(NSWindow* window) {
  NSView* const content = [window contentView];
  if (!content) return;
  const ButtonRow buttons(content);
  enlarge(window, std::max(buttons.missingWidth(), missingWidth(content)), 0);
  buttons.layOut();
  widenCells(content);
  enlarge(window, 0, missingHeightInside(content));
  growFields(content);
}

}  // namespace onramp::cocoa
