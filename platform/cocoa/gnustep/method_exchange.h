#pragma once

#import <objc/runtime.h>

namespace onramp::gnustep {

/// Replaces an instance method of the class `owner`, which must have that method. Returns the
/// previous implementation.
template <typename Implementation>
Implementation* replaceMethod(Class owner, SEL selector, Implementation* replacement) {
  return reinterpret_cast<Implementation*>(method_setImplementation(
      class_getInstanceMethod(owner, selector), reinterpret_cast<IMP>(replacement)));
}

/// Adds an instance method to the class `owner`, or replaces the method if the class has one of
/// that name. The method takes a BOOL and has no result.
inline void addMethod(Class owner, SEL selector, void (*implementation)(id, SEL, BOOL)) {
  class_replaceMethod(owner, selector, reinterpret_cast<IMP>(implementation), "v@:c");
}

}  // namespace onramp::gnustep
