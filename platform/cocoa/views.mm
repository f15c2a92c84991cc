#import "platform/cocoa/content_size.h"
#import "platform/cocoa/focus.h"
#import "platform/cocoa/native.h"
#import "platform/cocoa/text.h"

namespace onramp {

using cocoa::nativeOf;

namespace {

// Asks the screen reader to read the text of `field` aloud. Without this request, the screen reader
// might not read text that appears away from the keyboard focus.
void announce(NSTextField* field) {
  NSDictionary* const announcement = [NSDictionary
      dictionaryWithObjectsAndKeys:[field stringValue], NSAccessibilityAnnouncementKey,
                                   [NSNumber numberWithInteger:NSAccessibilityPriorityHigh],
                                   NSAccessibilityPriorityKey, nil];
  NSAccessibilityPostNotificationWithUserInfo(
      [field window], NSAccessibilityAnnouncementRequestedNotification, announcement);
}

}  // namespace

void View::setHidden(bool hidden) const {
  NSView* const view = nativeOf<NSView>(*this);
  const bool appears = [view isHidden] && !hidden;
  [view setHidden:hidden];
  cocoa::fitWindow([view window]);
  if (NSTextField* const field = nativeOf<NSTextField>(*this); appears && [field window]) {
    announce(field);
  }
}

View View::firstSubview() const {
  NSArray* const subviews = [nativeOf<NSView>(*this) subviews];
  return View(cocoa::toNative([subviews count] > 0 ? [subviews objectAtIndex:0] : nil));
}

void View::addSubview(const View& inner) const {
  NSView* const view = nativeOf<NSView>(*this);
  NSView* const added = nativeOf<NSView>(inner);
  if (!view || !added) return;
  [added setFrame:[view bounds]];
  [added setAutoresizingMask:NSViewWidthSizable | NSViewHeightSizable];
  [view addSubview:added];
  cocoa::fitWindow([view window]);
  cocoa::focusFirstControl(added);
}

void View::removeFromSuperview() const {
  [nativeOf<NSView>(*this) removeFromSuperview];
}

void Control::setEnabled(bool enabled) const {
  [nativeOf<NSControl>(*this) setEnabled:enabled];
}

void TextField::setStringValue(const std::string& text) const {
  NSTextField* const field = nativeOf<NSTextField>(*this);
  [field setStringValue:cocoa::toNSString(text)];
  cocoa::fitWindow([field window]);
}

}  // namespace onramp
