#pragma once

#import <objc/runtime.h>

namespace onramp::gnustep {

/// Puts `replacement` in the place of the class's instance method; returns what was there.
template <typename Implementation>
Implementation* replaceMethod(Class owner, SEL selector, Implementation* replacement) {
  return reinterpret_cast<Implementation*>(method_setImplementation(
      class_getInstanceMethod(owner, selector), reinterpret_cast<IMP>(replacement)));
}

/// Gives the class a method that it lacks or does not fulfil: one that takes a BOOL and gives
/// nothing.
inline void addMethod(Class owner, SEL selector, void (*implementation)(id, SEL, BOOL)) {
  class_replaceMethod(owner, selector, reinterpret_cast<IMP>(implementation), "v@:c");
}

}  // namespace onramp::gnustep
