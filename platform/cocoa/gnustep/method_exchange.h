#pragma once

#import <objc/runtime.h>

namespace onramp::gnustep {

/// Puts `replacement` in the place of the class's instance method; returns what was there.
template <typename Implementation>
Implementation* replaceMethod(Class owner, SEL selector, Implementation* replacement) {
  return reinterpret_cast<Implementation*>(method_setImplementation(
      class_getInstanceMethod(owner, selector), reinterpret_cast<IMP>(replacement)));
}

}  // namespace onramp::gnustep
