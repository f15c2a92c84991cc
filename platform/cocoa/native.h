#pragma once

#import <AppKit/AppKit.h>

#include "platform/outlets.h"

namespace onramp::cocoa {

/// Returns the object behind `outlet` if it is of class `Class`, or nil otherwise. Messages to nil
/// do nothing.
template <typename Class>
[[nodiscard]] Class* nativeOf(const Outlet& outlet) {
  id const object = reinterpret_cast<id>(outlet.native());
  return [object isKindOfClass:[Class class]] ? static_cast<Class*>(object) : nil;
}

[[nodiscard]] inline NativeObject* toNative(id object) {
  return reinterpret_cast<NativeObject*>(object);
}

}  // namespace onramp::cocoa
