// A stand-in for the dynamic store; CoreFoundation/CoreFoundation.h says what the stand-ins are
// for.
#pragma once

#include <CoreFoundation/CoreFoundation.h>

struct SCDynamicStoreContext {
  CFIndex version;
  const void* info;
  const void* (*retain)(const void*);
  void (*release)(const void*);
  std::nullptr_t copyDescription;
};

namespace standin {

/// A session with the store. SCDynamicStoreCopyMultiple() returns the keys or the patterns that it
/// was asked for, and also a value whose type the backend does not know.
struct Store : Object {
  Store() : Object(kOther) { last = this; }
  ~Store() override {
    if (context.release) context.release(context.info);
    last = nullptr;
  }

  void change(CFArrayRef keys) const { changed(this, keys, const_cast<void*>(context.info)); }

  static inline Store* last = nullptr;
  void (*changed)(const Store*, CFArrayRef, void*) = nullptr;
  SCDynamicStoreContext context{};
};

inline Object* string(const std::string& text) {
  return new Object(kString, text);
}

}  // namespace standin

using SCDynamicStoreRef = const standin::Store*;

inline const auto SCDynamicStoreCreate = [](std::nullptr_t, CFStringRef,
                                            decltype(standin::Store::changed) changed,
                                            SCDynamicStoreContext* context) {
  auto* const store = new standin::Store;
  if (context) {
    store->changed = changed;
    store->context = *context;
    store->context.info = context->retain(context->info);
  }
  return store;
};
inline const auto SCDynamicStoreKeyCreateNetworkInterfaceEntity =
    [](std::nullptr_t, CFStringRef domain, CFStringRef interface, CFStringRef entity) {
      return standin::string(domain->bytes + "/Network/Interface/" + interface->bytes + "/" +
                             entity->bytes);
    };
inline const auto SCDynamicStoreKeyCreateNetworkGlobalEntity =
    [](std::nullptr_t, CFStringRef domain, CFStringRef entity) {
      return standin::string(domain->bytes + "/Network/Global/" + entity->bytes);
    };
inline const auto SCDynamicStoreCopyMultiple = [](SCDynamicStoreRef store, CFArrayRef keys,
                                                  CFArrayRef patterns) -> CFDictionaryRef {
  if (!store) return nullptr;
  auto* const answer = new standin::Object(standin::kDictionary);
  for (const CFArrayRef asked : {keys, patterns}) {
    if (!asked) continue;
    CFRetain(asked);
    answer->members = {standin::string(asked == keys ? "keys" : "patterns"),
                       standin::objectOf(asked), standin::string("a number"),
                       new standin::Object(standin::kOther)};
  }
  return answer;
};
inline const auto SCDynamicStoreSetNotificationKeys = [](SCDynamicStoreRef store, CFArrayRef,
                                                         CFArrayRef) { return store != nullptr; };
inline const auto SCDynamicStoreCreateRunLoopSource = [](std::nullptr_t, SCDynamicStoreRef store,
                                                         int) -> CFRunLoopSourceRef {
  if (!store) return nullptr;
  auto* const source = new standin::Object(standin::kOther);
  CFArrayAppendValue(source, store);
  return source;
};
inline const auto CFRunLoopAddSource = [](CFRunLoopRef, CFRunLoopSourceRef, const char*) {};
inline const auto SCError = [] { return 2001; };
