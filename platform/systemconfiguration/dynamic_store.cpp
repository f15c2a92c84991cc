#include "platform/dynamic_store.h"

#include <SystemConfiguration/SystemConfiguration.h>

#include <utility>

#include "platform/corefoundation/convert.h"

namespace onramp {

using corefoundation::Reference;
using corefoundation::toCFArray;
using corefoundation::toCFString;
using corefoundation::toString;

struct DynamicStore {
  Reference<SCDynamicStoreRef> store;
};

struct DynamicStoreSource {
  Reference<CFRunLoopSourceRef> source;
};

namespace {

SCDynamicStoreRef nativeOf(const DynamicStoreRef& store) {
  return store ? store->store.get() : nullptr;
}

void changed(SCDynamicStoreRef, CFArrayRef changedKeys, void* callback) {
  std::vector<std::string> keys;
  for (CFIndex index = 0; index < CFArrayGetCount(changedKeys); ++index) {
    keys.push_back(toString(CFArrayGetValueAtIndex(changedKeys, index)).value_or(""));
  }
  (*static_cast<const DynamicStoreCallback*>(callback))(keys);
}

// The framework calls this function when it creates a session. The session owns the returned copy,
// and the framework calls releaseCallback() when it destroys the session.
const void* copyCallback(const void* callback) {
  return std::make_unique<DynamicStoreCallback>(*static_cast<const DynamicStoreCallback*>(callback))
      .release();
}

void releaseCallback(const void* callback) {
  const std::unique_ptr<const DynamicStoreCallback> last(
      static_cast<const DynamicStoreCallback*>(callback));
}

}  // namespace

DynamicStoreRef createDynamicStore(const std::string& name, DynamicStoreCallback callback) {
  SCDynamicStoreContext context = {0, &callback, copyCallback, releaseCallback, nullptr};
  Reference<SCDynamicStoreRef> store(
      SCDynamicStoreCreate(kCFAllocatorDefault, toCFString(name).get(),
                           callback ? changed : nullptr, callback ? &context : nullptr));
  return store ? std::make_shared<DynamicStore>(DynamicStore{std::move(store)}) : nullptr;
}

std::optional<std::string> createNetworkInterfaceEntityKey(std::string_view domain,
                                                           std::string_view interface,
                                                           std::string_view entity) {
  const Reference<CFStringRef> key(SCDynamicStoreKeyCreateNetworkInterfaceEntity(
      kCFAllocatorDefault, toCFString(domain).get(), toCFString(interface).get(),
      toCFString(entity).get()));
  return toString(key.get());
}

std::optional<std::string> createNetworkGlobalEntityKey(std::string_view domain,
                                                        std::string_view entity) {
  const Reference<CFStringRef> key(SCDynamicStoreKeyCreateNetworkGlobalEntity(
      kCFAllocatorDefault, toCFString(domain).get(), toCFString(entity).get()));
  return toString(key.get());
}

std::optional<Dictionary> copyMultiple(const DynamicStoreRef& store,
                                       const std::vector<std::string>& keys,
                                       const std::vector<std::string>& patterns) {
  const Reference<CFDictionaryRef> values(
      SCDynamicStoreCopyMultiple(nativeOf(store), keys.empty() ? nullptr : toCFArray(keys).get(),
                                 patterns.empty() ? nullptr : toCFArray(patterns).get()));
  const std::optional<Value> value = corefoundation::toValue(values.get());
  const Dictionary* const dictionary = value ? value->as<Dictionary>() : nullptr;
  return dictionary ? std::optional(*dictionary) : std::nullopt;
}

bool setNotificationKeys(const DynamicStoreRef& store, const std::vector<std::string>& keys,
                         const std::vector<std::string>& patterns) {
  return SCDynamicStoreSetNotificationKeys(nativeOf(store),
                                           keys.empty() ? nullptr : toCFArray(keys).get(),
                                           patterns.empty() ? nullptr : toCFArray(patterns).get());
}

DynamicStoreSourceRef createRunLoopSource(const DynamicStoreRef& store, int order) {
  Reference<CFRunLoopSourceRef> source(
      SCDynamicStoreCreateRunLoopSource(kCFAllocatorDefault, nativeOf(store), order));
  return source ? std::make_shared<DynamicStoreSource>(DynamicStoreSource{std::move(source)})
                : nullptr;
}

void addSourceToMainLoop(const DynamicStoreSourceRef& source) {
  if (!source) return;
  CFRunLoopAddSource(CFRunLoopGetMain(), source->source.get(), kCFRunLoopCommonModes);
}

int lastDynamicStoreError() {
  return SCError();
}

}  // namespace onramp
