#include "platform/interface_file.h"

#include <utility>
#include <vector>

#include "platform/bundle.h"
#import "platform/cocoa/action.h"
#import "platform/cocoa/file_owner.h"
#import "platform/cocoa/native.h"
#import "platform/cocoa/retained.h"
#import "platform/cocoa/text.h"

namespace onramp {

using cocoa::Retained;
using cocoa::toNSString;
using cocoa::toStdString;

struct Interface::Tree {
  Retained<OnrampFileOwner> owner;
  Retained<NSArray> topLevelObjects;
  std::vector<Retained<OnrampAction>> actions;
};

namespace {

constexpr std::string_view kWindowOutlet = "window";

NSView* rootView(NSArray* topLevelObjects) {
  for (id object in topLevelObjects) {
    if ([object isKindOfClass:[NSView class]]) return object;
  }
  return nil;
}

Class classOfKind(OutletKind kind) {
  switch (kind) {
    case OutletKind::kView:
      return [NSView class];
    case OutletKind::kTextField:
      return [NSTextField class];
    case OutletKind::kButton:
      return [NSButton class];
    case OutletKind::kRadioMatrix:
      return [NSMatrix class];
    case OutletKind::kImageView:
      return [NSImageView class];
    case OutletKind::kProgressIndicator:
      return [NSProgressIndicator class];
    case OutletKind::kTableView:
      return [NSTableView class];
    case OutletKind::kPopUpButton:
      return [NSPopUpButton class];
    case OutletKind::kWindow:
    case OutletKind::kMenu:
    case OutletKind::kMenuItem:
      break;
  }
  return Nil;
}

NSView* findView(NSView* view, NSString* identifier, Class kind) {
  if ([[view identifier] isEqualToString:identifier] && [view isKindOfClass:kind]) return view;
  for (NSView* subview in [view subviews]) {
    if (NSView* const found = findView(subview, identifier, kind)) return found;
  }
  return nil;
}

// Marks each page title as a heading for assistive technology. A page title is a text field whose
// identifier ends in "Title". AppKit has no constant for the heading role.
void describe(NSView* view) {
  if ([view isKindOfClass:[NSTextField class]] && [[view identifier] hasSuffix:@"Title"]) {
    [NSAccessibilityUnignoredDescendant(view) setAccessibilityRole:@"AXHeading"];
  }
  for (NSView* subview in [view subviews])
    describe(subview);
}

// Translates the tool tips. Each translation also becomes the accessibility label of its view,
// because only controls without a title have tool tips.
void localize(NSView* view, const std::string& interfaceName) {
  if (const std::string key = toStdString([view toolTip]); !key.empty()) {
    NSString* const text = toNSString(Bundle::main().localizedString(key, key, interfaceName));
    [view setToolTip:text];
    [view setAccessibilityLabel:text];
  }
  for (NSView* subview in [view subviews])
    localize(subview, interfaceName);
}

// Makes a click on each button perform the owner's action that the button's selector names. Skips
// buttons that have no selector or already have a target. (A button has no target here if the
// interface file connects it to the first responder.)
void connectActions(NSView* view, InterfaceOwner& owner,
                    std::vector<Retained<OnrampAction>>& actions) {
  if ([view isKindOfClass:[NSButton class]]) {
    NSButton* const button = static_cast<NSButton*>(view);
    if ([button action] && ![button target]) {
      const std::string selector = toStdString(NSStringFromSelector([button action]));
      const std::string name = selector.substr(0, selector.find(':'));
      OnrampAction* const action =
          [OnrampAction actionWithFunction:[&owner, name] { owner.performAction(name); }];
      actions.emplace_back(action);
      [button setTarget:action];
      [button setAction:@selector(perform:)];
    }
  }
  for (NSView* subview in [view subviews])
    connectActions(subview, owner, actions);
}

// Returns the file's top-level objects, or nil if the file is missing or damaged. AppKit reports
// failure either by throwing an exception or by returning NO.
NSArray* instantiate(NSString* name, OnrampFileOwner* owner) {
  NSArray* topLevelObjects = nil;
  @try {
    NSNib* const nib = [[[NSNib alloc] initWithNibNamed:name
                                                 bundle:[NSBundle mainBundle]] autorelease];
    if (![nib instantiateWithOwner:owner topLevelObjects:&topLevelObjects]) return nil;
  } @catch (NSException*) {
    return nil;
  }
  return topLevelObjects;
}

}  // namespace

Interface::Interface(std::unique_ptr<Tree> tree) : tree_(std::move(tree)) {}

// Removes the page from the window if the page is still shown.
Interface::~Interface() {
  [rootView(tree_->topLevelObjects.get()) removeFromSuperview];
}

std::unique_ptr<Interface> Interface::load(const std::string& name, InterfaceOwner& owner) {
  auto tree = std::make_unique<Tree>();
  tree->owner = Retained<OnrampFileOwner>::adopt([[OnrampFileOwner alloc] initWithOwner:owner]);
  NSArray* const objects = instantiate(toNSString(name), tree->owner.get());
  if (!objects) return nullptr;
  tree->topLevelObjects = Retained<NSArray>(objects);

  for (NSView *view in [NSArray arrayWithObjects:rootView(objects), nil]) {
    localize(view, name);
    describe(view);
    connectActions(view, owner, tree->actions);
  }
  if (NSWindow* const window = [tree->owner.get() window]) {
    // Without this call, AppKit would not let the application quit while a modal loop is running or
    // a sheet is open. With it, AppKit asks the delegate.
    [window setPreventsApplicationTerminationWhenModal:NO];
    localize([window contentView], name);
    connectActions([window contentView], owner, tree -> actions);
  }
  return std::unique_ptr<Interface>(new Interface(std::move(tree)));
}

View Interface::view() const {
  return View(cocoa::toNative(rootView(tree_->topLevelObjects.get())));
}

// The file stores the page's class in the root view's identifier, because AppKit has no concept of
// a page class.
std::string Interface::viewClass() const {
  return toStdString([rootView(tree_->topLevelObjects.get()) identifier]);
}

// Finds a view by its identifier, and the window through the outlet of the file's owner.
NativeObject* Interface::find(std::string_view name, OutletKind kind) const {
  NSWindow* const window = [tree_->owner.get() window];
  if (kind == OutletKind::kWindow) return name == kWindowOutlet ? cocoa::toNative(window) : nullptr;
  const Class wanted = classOfKind(kind);
  if (!wanted) return nullptr;
  NSString* const identifier = toNSString(name);
  NSView* const found = findView(rootView(tree_->topLevelObjects.get()), identifier, wanted);
  return cocoa::toNative(found ? found : findView([window contentView], identifier, wanted));
}

}  // namespace onramp
