#include "platform/run_loop.h"

#import <AppKit/AppKit.h>

#include <utility>

#include "platform/application.h"
#import "platform/cocoa/action.h"
#import "platform/cocoa/focus.h"
#import "platform/cocoa/native.h"

namespace onramp {

namespace {

NSArray* allModes() {
  return [NSArray arrayWithObjects:NSDefaultRunLoopMode, NSModalPanelRunLoopMode,
                                   NSEventTrackingRunLoopMode, nil];
}

// Whether the running modal loop was asked to end. Main thread only.
bool isModalAborted = false;

// Returns an object that runs `action` only once, even if its timer fires again inside a loop that
// the action runs. The action is destroyed on the thread that ran it, even if another thread
// releases the object last.
OnrampAction* once(std::function<void()> action) {
  return [OnrampAction actionWithFunction:[action = std::move(action)]() mutable {
    if (const auto pending = std::exchange(action, nullptr)) pending();
  }];
}

// Posts an empty event, because a modal loop checks whether it was stopped only after it has
// handled an event.
void wakeEventLoop() {
  [NSApp postEvent:[NSEvent otherEventWithType:NSApplicationDefined
                                      location:NSZeroPoint
                                 modifierFlags:0
                                     timestamp:0
                                  windowNumber:0
                                       context:nil
                                       subtype:0
                                         data1:0
                                         data2:0]
           atStart:NO];
}

}  // namespace

void scheduleTimer(std::chrono::milliseconds delay, std::function<void()> action) {
  const NSTimeInterval seconds = std::chrono::duration<double>(delay).count();
  NSTimer* const timer = [NSTimer timerWithTimeInterval:seconds
                                                 target:once(std::move(action))
                                               selector:@selector(perform:)
                                               userInfo:nil
                                                repeats:NO];
  for (NSString* mode in allModes())
    [[NSRunLoop mainRunLoop] addTimer:timer forMode:mode];
}

void performOnMainThread(std::function<void()> action) {
  @autoreleasepool {
    [once(std::move(action)) performSelectorOnMainThread:@selector(perform:)
                                              withObject:nil
                                           waitUntilDone:NO
                                                   modes:allModes()];
  }
}

// AppKit may end a modal loop without being asked, for example when the user presses a key that
// cancels. The loop is then run again.
void runModalForWindow(const Window& window) {
  // AppKit does not show windows of a hidden application.
  if ([NSApp isHidden]) unhideApplication();
  window.makeKeyAndOrderFront();
  NSWindow* const modal = cocoa::nativeOf<NSWindow>(window);
  // The close button is disabled, because the controller refuses to close the window while the loop
  // runs.
  NSButton* const closeButton = [modal standardWindowButton:NSWindowCloseButton];
  [closeButton setEnabled:NO];
  isModalAborted = !modal;
  while (!isModalAborted)
    [NSApp runModalForWindow:modal];
  [closeButton setEnabled:YES];
  cocoa::focusFirstControl([modal contentView]);
}

void abortModal() {
  performOnMainThread([] {
    isModalAborted = true;
    [NSApp stopModalWithCode:NSModalResponseAbort];
    wakeEventLoop();
  });
}

}  // namespace onramp
