#include "platform/application.h"
#import "platform/cocoa/native.h"
#import "platform/cocoa/text.h"

namespace onramp {

using cocoa::nativeOf;
using cocoa::toNative;

Menu mainMenu() {
  return Menu(toNative([NSApp mainMenu]));
}

void setMainMenu(const Menu& menu) {
  [NSApp setMainMenu:nativeOf<NSMenu>(menu)];
}

MenuItem Menu::itemWithTitle(const std::string& title) const {
  return MenuItem(toNative([nativeOf<NSMenu>(*this) itemWithTitle:cocoa::toNSString(title)]));
}

Menu MenuItem::submenu() const {
  return Menu(toNative([nativeOf<NSMenuItem>(*this) submenu]));
}

void MenuItem::setTitle(const std::string& title) const {
  [nativeOf<NSMenuItem>(*this) setTitle:cocoa::toNSString(title)];
}

}  // namespace onramp
