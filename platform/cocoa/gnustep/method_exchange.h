#pragma once

#import <objc/runtime.h>

namespace onramp::gnustep {

/// Replaces an instance method of the class `owner` and returns the previous implementation. The
/// class must have the method. If the class inherits the method, the superclass gets the
/// replacement. To replace a class method, pass the metaclass as `owner`.
template <typename Implementation>
Implementation* replaceMethod(Class owner, SEL selector, Implementation* replacement) {
  return reinterpret_cast<Implementation*>(method_setImplementation(
      class_getInstanceMethod(owner, selector), reinterpret_cast<IMP>(replacement)));
}

/// Adds an instance method to the class `owner`. Replaces any method that the class already has for
/// `selector`. The method takes one BOOL and returns void.
inline void addMethod(Class owner, SEL selector, void (*implementation)(id, SEL, BOOL)) {
  class_replaceMethod(owner, selector, reinterpret_cast<IMP>(implementation), "v@:c");
}

}  // namespace onramp::gnustep
