#include "platform/run_loop.h"

#import <AppKit/AppKit.h>

#include <atomic>
#include <utility>

#include "platform/application.h"
#import "platform/cocoa/action.h"
#include "platform/cocoa/event_loop.h"
#import "platform/cocoa/focus.h"
#import "platform/cocoa/native.h"

namespace onramp {

namespace {

NSArray* allModes() {
  return [NSArray arrayWithObjects:NSDefaultRunLoopMode, NSModalPanelRunLoopMode,
                                   NSEventTrackingRunLoopMode, nil];
}

// The number of running modal loops, and whether the innermost loop was asked to end. Main thread
// only.
int modalLoops = 0;
bool isModalAborted = false;

// True from abortModal() until the modal loop has returned, or until the main thread has found that
// no loop is running. Meanwhile, the actions that were passed to performOnMainThread() do not
// run, because each of them could keep the loop from returning for seconds.
std::atomic<bool> isAborting = false;

// Returns an object that runs `action` only once, even if a timer calls the object again while
// `action` runs a modal loop. The object destroys `action` right after running it, on the same
// thread, because any thread may release the object.
OnrampAction* once(std::function<void()> action) {
  return [OnrampAction actionWithFunction:[action = std::move(action)]() mutable {
    if (const auto pending = std::exchange(action, nullptr)) pending();
  }];
}

void post(std::function<void()> action) {
  @autoreleasepool {
    [once(std::move(action)) performSelectorOnMainThread:@selector(perform:)
                                              withObject:nil
                                           waitUntilDone:NO
                                                   modes:allModes()];
  }
}

// Drops the clicks and key presses that arrived while the main thread was busy. The user meant them
// for the page that was shown at that time. No timer or posted action runs in the loop mode used
// here.
void dropWaitingInput() {
  const NSUInteger input = NSLeftMouseDownMask | NSLeftMouseUpMask | NSRightMouseDownMask |
                           NSRightMouseUpMask | NSKeyDownMask | NSKeyUpMask;
  while ([NSApp nextEventMatchingMask:input
                            untilDate:[NSDate distantPast]
                               inMode:@"OnrampDropInput"
                              dequeue:YES]) {
  }
}

}  // namespace

void cocoa::wakeEventLoop() {
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
  post([action = std::move(action)]() mutable {
    if (isAborting && modalLoops > 0) {
      performOnMainThread(std::move(action));
    } else {
      action();
    }
  });
}

// Starts AppKit's loop again if it ends without a call to abortModal(), for example because the
// user has pressed a key that cancels the loop.
void runModalForWindow(const Window& window) {
  // The loop counts as running before the window is shown, because showing the window may run a
  // posted action that calls abortModal().
  ++modalLoops;
  // AppKit does not show windows of a hidden application.
  if ([NSApp isHidden]) unhideApplication();
  window.makeKeyAndOrderFront();
  NSWindow* const modal = cocoa::nativeOf<NSWindow>(window);
  // The close button is disabled, because the window must not close while the loop runs.
  NSButton* const closeButton = [modal standardWindowButton:NSWindowCloseButton];
  [closeButton setEnabled:NO];
  while (modal && !isModalAborted)
    [NSApp runModalForWindow:modal];
  --modalLoops;
  isModalAborted = false;
  isAborting = false;
  dropWaitingInput();
  [closeButton setEnabled:YES];
  cocoa::focusFirstControl([modal contentView]);
}

void abortModal() {
  isAborting = true;
  post([] {
    if (modalLoops == 0) {
      isAborting = false;
      return;
    }
    isModalAborted = true;
    if (![NSApp modalWindow]) return;  // AppKit's loop has not started yet
    [NSApp stopModalWithCode:NSModalResponseAbort];
    cocoa::wakeEventLoop();
  });
}

}  // namespace onramp
