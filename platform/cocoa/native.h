#pragma once

#import <AppKit/AppKit.h>

#include "platform/outlets.h"

namespace onramp::cocoa {

/// The object that `outlet` stands for if it is of that class; else nil, which takes every message.
template <typename Class>
[[nodiscard]] Class* nativeOf(const Outlet& outlet) {
  id const object = reinterpret_cast<id>(outlet.native());
  return [object isKindOfClass:[Class class]] ? static_cast<Class*>(object) : nil;
}

[[nodiscard]] inline NativeObject* toNative(id object) {
  return reinterpret_cast<NativeObject*>(object);
}

}  // namespace onramp::cocoa
