#include "platform/corefoundation/convert.h"

#include <cstddef>
#include <utility>

namespace onramp::corefoundation {

namespace {

bool isOfType(CFTypeRef object, CFTypeID type) {
  return object && CFGetTypeID(object) == type;
}

Value toArray(CFArrayRef objects) {
  Array values;
  for (CFIndex index = 0; index < CFArrayGetCount(objects); ++index) {
    if (auto value = toValue(CFArrayGetValueAtIndex(objects, index))) {
      values.push_back(*std::move(value));
    }
  }
  return values;
}

void addPair(const void* key, const void* object, void* pairs) {
  const auto text = toString(key);
  auto value = toValue(object);
  if (!text || !value) return;
  static_cast<std::vector<Dictionary::Pair>*>(pairs)->emplace_back(*text, *std::move(value));
}

}  // namespace

Reference<CFStringRef> toCFString(std::string_view text) {
  return Reference<CFStringRef>(CFStringCreateWithBytes(
      kCFAllocatorDefault, reinterpret_cast<const UInt8*>(text.data()),
      static_cast<CFIndex>(text.size()), kCFStringEncodingUTF8, /*isExternal=*/false));
}

Reference<CFArrayRef> toCFArray(const std::vector<std::string>& texts) {
  const Reference<CFMutableArrayRef> array(
      CFArrayCreateMutable(kCFAllocatorDefault, 0, &kCFTypeArrayCallBacks));
  for (const std::string& text : texts) {
    if (const auto string = toCFString(text)) CFArrayAppendValue(array.get(), string.get());
  }
  return Reference<CFArrayRef>::retaining(array.get());
}

std::optional<std::string> toString(CFTypeRef object) {
  if (!isOfType(object, CFStringGetTypeID())) return std::nullopt;
  const auto string = static_cast<CFStringRef>(object);
  const CFRange all = CFRangeMake(0, CFStringGetLength(string));
  CFIndex size = 0;
  CFStringGetBytes(string, all, kCFStringEncodingUTF8, 0, false, nullptr, 0, &size);
  std::string text(static_cast<std::size_t>(size), '\0');
  CFStringGetBytes(string, all, kCFStringEncodingUTF8, 0, false,
                   reinterpret_cast<UInt8*>(text.data()), size, nullptr);
  return text;
}

Data toData(CFDataRef data) {
  const auto* const bytes = reinterpret_cast<const std::byte*>(CFDataGetBytePtr(data));
  return Data(bytes, bytes + CFDataGetLength(data));
}

std::optional<Value> toValue(CFTypeRef object) {
  if (auto text = toString(object)) return Value(*std::move(text));
  if (isOfType(object, CFArrayGetTypeID())) return toArray(static_cast<CFArrayRef>(object));
  if (isOfType(object, CFDictionaryGetTypeID())) {
    std::vector<Dictionary::Pair> pairs;
    CFDictionaryApplyFunction(static_cast<CFDictionaryRef>(object), addPair, &pairs);
    return Value(Dictionary(std::move(pairs)));
  }
  return std::nullopt;
}

}  // namespace onramp::corefoundation
