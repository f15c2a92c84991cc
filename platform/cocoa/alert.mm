#include "platform/alert.h"

#include <memory>
#include <utility>

#import "platform/cocoa/native.h"
#import "platform/cocoa/retained.h"
#import "platform/cocoa/text.h"

/// The delegate of one sheet. When the sheet closes, passes kAlertOtherReturn or
/// kAlertDefaultReturn to the initializer's function, and releases itself.
@interface OnrampSheetEnd : NSObject {
  std::function<void(int)> _didEnd;
}
@end

@implementation OnrampSheetEnd

- (instancetype)initWithFunction:(std::function<void(int)>)didEnd {
  self = [super init];
  if (self) _didEnd = std::move(didEnd);
  return self;
}

- (void)alertDidEnd:(NSAlert*)alert
         returnCode:(NSInteger)returnCode
        contextInfo:(void*)contextInfo {
  [self autorelease];
  // Code outside this file can also close the sheet, with a return code that belongs to no button.
  _didEnd(returnCode == NSAlertSecondButtonReturn ? onramp::kAlertOtherReturn
                                                  : onramp::kAlertDefaultReturn);
}

@end

namespace onramp {

using cocoa::Retained;
using cocoa::toNSString;

namespace {

Retained<NSAlert> makeAlert(const std::string& messageText, const std::string& informativeText) {
  auto alert = Retained<NSAlert>::adopt([[NSAlert alloc] init]);
  [alert.get() setMessageText:toNSString(messageText)];
  [alert.get() setInformativeText:toNSString(informativeText)];
  return alert;
}

}  // namespace

void runCriticalAlert(const std::string& messageText, const std::string& informativeText,
                      const std::string& buttonTitle) {
  const Retained<NSAlert> alert = makeAlert(messageText, informativeText);
  [alert.get() setAlertStyle:NSCriticalAlertStyle];
  [alert.get() addButtonWithTitle:toNSString(buttonTitle)];
  // At launch, the application is not active yet. Without this call, the alert would open behind
  // the Finder's windows.
  [NSApp activateIgnoringOtherApps:YES];
  [alert.get() runModal];
}

void beginAlertSheet(const AlertSheet& sheet, const Window& window,
                     std::function<void(int returnCode)> didEnd) {
  const Retained<NSAlert> alert = makeAlert(sheet.title, sheet.message);
  [alert.get() addButtonWithTitle:toNSString(sheet.defaultButton)];
  [alert.get() addButtonWithTitle:toNSString(sheet.otherButton)];
  // Without this call, AppKit would not let the application quit while the sheet is open.
  [[alert.get() window] setPreventsApplicationTerminationWhenModal:NO];
  [alert.get() beginSheetModalForWindow:cocoa::nativeOf<NSWindow>(window)
                          modalDelegate:[[OnrampSheetEnd alloc] initWithFunction:std::move(didEnd)]
                         didEndSelector:@selector(alertDidEnd:returnCode:contextInfo:)
                            contextInfo:nullptr];
}

}  // namespace onramp
