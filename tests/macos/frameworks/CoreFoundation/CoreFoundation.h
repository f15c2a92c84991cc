// A stand-in for the part of Core Foundation that corefoundation, cfnetwork and systemconfiguration
// in platform/ use. With the stand-ins in tests/macos/frameworks, these backends compile and run on
// Linux. The tests show how the backends use the frameworks' objects, not how macOS behaves. The
// sanitizers report an object that a backend releases too often or never.
#pragma once

#include <cstddef>
#include <cstdint>
#include <string>
#include <vector>

#include "base/text.h"

using CFTypeRef = const void*;
using CFIndex = long;
using CFTypeID = unsigned long;
using CFOptionFlags = unsigned long;
using UInt8 = unsigned char;
using SInt32 = std::int32_t;
using CFRunLoopRef = const char*;

namespace standin {

enum Kind : CFTypeID { kString, kData, kArray, kDictionary, kOther };

struct Object {
  explicit Object(Kind ownKind, std::string ownBytes = {}) : kind(ownKind), bytes(ownBytes) {}
  Object(const Object&) = delete;
  Object& operator=(const Object&) = delete;
  virtual ~Object() {
    for (Object* const member : members)
      member->release();
  }

  void release() {
    if (--references == 0) delete this;
  }

  Kind kind;
  std::string bytes;             // the contents of a string or data object
  std::vector<Object*> members;  // owned; in a dictionary, keys and values alternate
  int references = 1;
};

inline Object* objectOf(CFTypeRef object) {
  return const_cast<Object*>(static_cast<const Object*>(object));
}

inline constexpr char kMainLoop[] = "main";

}  // namespace standin

using CFStringRef = const standin::Object*;
using CFDataRef = const standin::Object*;
using CFArrayRef = const standin::Object*;
using CFMutableArrayRef = standin::Object*;
using CFDictionaryRef = const standin::Object*;
using CFRunLoopSourceRef = standin::Object*;

inline constexpr std::nullptr_t kCFAllocatorDefault = nullptr;
inline constexpr int kCFStringEncodingUTF8 = 0x08000100;
inline constexpr int kCFTypeArrayCallBacks = 0;
inline constexpr char kCFRunLoopCommonModes[] = "common";

inline const auto CFRunLoopGetMain = []() -> CFRunLoopRef { return standin::kMainLoop; };
inline const auto CFRunLoopGetCurrent = CFRunLoopGetMain;

inline const auto CFRetain = [](CFTypeRef object) { ++standin::objectOf(object)->references; };
inline const auto CFRelease = [](CFTypeRef object) { standin::objectOf(object)->release(); };
inline const auto CFGetTypeID = [](CFTypeRef object) { return standin::objectOf(object)->kind; };
inline const auto CFStringGetTypeID = [] { return standin::kString; };
inline const auto CFArrayGetTypeID = [] { return standin::kArray; };
inline const auto CFDictionaryGetTypeID = [] { return standin::kDictionary; };

inline const auto CFStringCreateWithBytes = [](std::nullptr_t, const UInt8* bytes, CFIndex size,
                                               int, bool) -> CFStringRef {
  std::string text(reinterpret_cast<const char*>(bytes), static_cast<std::size_t>(size));
  return onramp::isUTF8(text) ? new standin::Object(standin::kString, text) : nullptr;
};
// The real function returns the number of UTF-16 units, not of bytes. The difference does not
// matter, because the backends always read whole strings.
inline const auto CFStringGetLength = [](CFStringRef text) { return text->bytes.size(); };
inline const auto CFRangeMake = [](int, std::size_t length) { return length; };
using CFRange = std::size_t;
inline const auto CFStringGetBytes = [](CFStringRef text, CFRange, int, int, bool, UInt8* buffer,
                                        CFIndex room, CFIndex* used) {
  if (buffer) text->bytes.copy(reinterpret_cast<char*>(buffer), static_cast<std::size_t>(room));
  if (used) *used = static_cast<CFIndex>(text->bytes.size());
};

inline const auto CFDataGetBytePtr = [](CFDataRef data) { return data->bytes.data(); };
inline const auto CFDataGetLength = [](CFDataRef data) { return data->bytes.size(); };

inline const auto CFArrayCreateMutable = [](std::nullptr_t, int, const int*) {
  return new standin::Object(standin::kArray);
};
inline const auto CFArrayAppendValue = [](CFMutableArrayRef array, CFTypeRef value) {
  CFRetain(value);
  array->members.push_back(standin::objectOf(value));
};
inline const auto CFArrayGetCount = [](CFArrayRef array) {
  return static_cast<CFIndex>(array->members.size());
};
inline const auto CFArrayGetValueAtIndex = [](CFArrayRef array, CFIndex index) -> CFTypeRef {
  return array->members.at(static_cast<std::size_t>(index));
};
inline const auto CFDictionaryApplyFunction =
    [](CFDictionaryRef pairs, void (*apply)(CFTypeRef, CFTypeRef, void*), void* context) {
      for (std::size_t at = 0; at < pairs->members.size(); at += 2)
        apply(pairs->members[at], pairs->members[at + 1], context);
    };
