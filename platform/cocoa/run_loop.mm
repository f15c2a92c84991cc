#include "platform/run_loop.h"

#import <AppKit/AppKit.h>

#include <utility>

#import "platform/cocoa/action.h"
#import "platform/cocoa/native.h"

namespace onramp {

namespace {

NSArray* allModes() {
  return [NSArray arrayWithObjects:NSDefaultRunLoopMode, NSModalPanelRunLoopMode,
                                   NSEventTrackingRunLoopMode, nil];
}

// Whether the modal loop that runs was asked to end. Main thread only.
bool isModalAborted = false;

// The action may run a loop of its own, in which its timer must not fire again. What it holds ends
// where it has run, not with the last reference to the object, which another thread may have.
OnrampAction* once(std::function<void()> action) {
  return [OnrampAction actionWithFunction:[action = std::move(action)]() mutable {
    if (const auto pending = std::exchange(action, nullptr)) pending();
  }];
}

// A modal loop looks whether it was stopped when it has handled an event.
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

void scheduleTimer(double seconds, std::function<void()> action) {
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

// The platform ends a modal loop for reasons of its own as well, such as a key that cancels; the
// window is then still waited for.
void runModalForWindow(const Window& window) {
  window.makeKeyAndOrderFront();
  NSWindow* const modal = cocoa::nativeOf<NSWindow>(window);
  isModalAborted = !modal;
  while (!isModalAborted)
    [NSApp runModalForWindow:modal];
}

void abortModal() {
  performOnMainThread([] {
    isModalAborted = true;
    [NSApp stopModalWithCode:NSModalResponseAbort];
    wakeEventLoop();
  });
}

}  // namespace onramp
