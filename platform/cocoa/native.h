#pragma once

#import <AppKit/AppKit.h>

#include "platform/outlets.h"

namespace onramp::cocoa {

/// Returns the object to which `outlet` refers, or nil if `outlet` is empty or the object is not of
/// class `Class`. Most callers need not check for nil, because messages to nil do nothing.
template <typename Class>
[[nodiscard]] Class* nativeOf(const Outlet& outlet) {
  id const object = reinterpret_cast<id>(outlet.native());
  return [object isKindOfClass:[Class class]] ? static_cast<Class*>(object) : nil;
}

/// Returns `object` in the form in which an Outlet stores it. The result is null if `object` is
/// nil. Does not retain `object`.
[[nodiscard]] inline NativeObject* toNative(id object) {
  return reinterpret_cast<NativeObject*>(object);
}

}  // namespace onramp::cocoa
