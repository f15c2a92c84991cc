#include "platform/application.h"

#include <cstdio>

#include "platform/bundle.h"
#import "platform/cocoa/native.h"
#import "platform/cocoa/retained.h"
#include "platform/termination.h"

/// The AppKit delegate of the application and of its window. Passes most of their events and
/// questions to an onramp::ApplicationDelegate.
@interface OnrampDelegate : NSObject <NSApplicationDelegate, NSWindowDelegate> {
  onramp::ApplicationDelegate* _delegate;
  onramp::Window _window;
}
@end

@implementation OnrampDelegate

- (instancetype)initWithDelegate:(onramp::ApplicationDelegate&)delegate
                          window:(const onramp::Window&)window {
  self = [super init];
  if (self) {
    _delegate = &delegate;
    _window = window;
    [onramp::cocoa::nativeOf<NSWindow>(window) setDelegate:self];
  }
  return self;
}

- (void)applicationWillFinishLaunching:(NSNotification*)notification {
  _delegate->applicationWillFinishLaunching();
}

- (void)applicationDidFinishLaunching:(NSNotification*)notification {
  _delegate->applicationDidFinishLaunching();
}

- (BOOL)applicationShouldTerminateAfterLastWindowClosed:(NSApplication*)application {
  return _delegate->applicationShouldTerminateAfterLastWindowClosed();
}

// Lets the user quit only if the window may close. After terminateApplication(), always allows it.
- (NSApplicationTerminateReply)applicationShouldTerminate:(NSApplication*)application {
  if (onramp::isTerminating() || _delegate->windowShouldClose(_window)) return NSTerminateNow;
  NSBeep();
  return NSTerminateCancel;
}

- (BOOL)applicationSupportsSecureRestorableState:(NSApplication*)application {
  return YES;
}

- (void)applicationWillTerminate:(NSNotification*)notification {
  onramp::beginTermination();
}

- (BOOL)windowShouldClose:(NSWindow*)window {
  return _delegate->windowShouldClose(_window);
}

@end

namespace onramp {

using cocoa::Retained;

// Ignores the arguments, because AppKit reads them from the process.
int runApplication(int, char**, const std::string& mainInterfaceName,
                   const std::function<std::unique_ptr<ApplicationDelegate>()>& makeDelegate) {
  @autoreleasepool {
    NSApplication* const application = [NSApplication sharedApplication];
    const std::unique_ptr<ApplicationDelegate> delegate = makeDelegate();
    const std::unique_ptr<Interface> mainInterface = Interface::load(mainInterfaceName, *delegate);
    if (!mainInterface) {
      std::fprintf(stderr, "%s: no interface file %s; copy the application again\n",
                   Bundle::main().path().c_str(), mainInterfaceName.c_str());
      return 1;
    }
    const auto listener = Retained<OnrampDelegate>::adopt([[OnrampDelegate alloc]
        initWithDelegate:*delegate
                  window:mainInterface->outlet<Window>("window")]);
    [application setDelegate:listener.get()];
    delegate->setOutlets(*mainInterface);
    delegate->awakeFromNib();
    [application run];
    return 0;
  }
}

void terminateApplication() {
  beginTermination();
  [NSApp terminate:nil];
}

void hideApplication() {
  [NSApp hide:nil];
}

void unhideApplication() {
  [NSApp unhide:nil];
}

void activateIgnoringOtherApps() {
  [NSApp activateIgnoringOtherApps:YES];
}

}  // namespace onramp
