#pragma once

#import <objc/runtime.h>

namespace onramp::gnustep {

/// Replaces the class's instance method and returns the previous implementation.
template <typename Implementation>
Implementation* replaceMethod(Class owner, SEL selector, Implementation* replacement) {
  return reinterpret_cast<Implementation*>(method_setImplementation(
      class_getInstanceMethod(owner, selector), reinterpret_cast<IMP>(replacement)));
}

/// Adds a method to the class, or replaces it. The method takes a BOOL and returns nothing.
inline void addMethod(Class owner, SEL selector, void (*implementation)(id, SEL, BOOL)) {
  class_replaceMethod(owner, selector, reinterpret_cast<IMP>(implementation), "v@:c");
}

}  // namespace onramp::gnustep
