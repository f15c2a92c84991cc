#include "platform/property_list.h"

#include <cstring>
#include <utility>

#import "platform/cocoa/property_list.h"
#import "platform/cocoa/text.h"
#include "platform/posix/file.h"

namespace onramp {

namespace {

// Converts one property list to a value. read() returns nothing when the list exceeds the limits in
// platform/property_list.h or `object` is not a property-list object.
class Reader {
 public:
  std::optional<Value> read(id object, std::size_t depth) {
    if (depth > kMostPropertyListDepth || ++objects_ > kMostPropertyListObjects) isExceeded_ = true;
    if (isExceeded_) return std::nullopt;
    if ([object isKindOfClass:[NSString class]]) return string(object);
    if ([object isKindOfClass:[NSNumber class]]) return number(object);
    if ([object isKindOfClass:[NSDictionary class]]) return dictionary(object, depth);
    if ([object isKindOfClass:[NSArray class]]) return array(object, depth);
    if ([object isKindOfClass:[NSData class]]) return data(object);
    if ([object isKindOfClass:[NSDate class]]) {
      return Value(Date{[object timeIntervalSinceReferenceDate]});
    }
    return std::nullopt;
  }

 private:
  // Only two Boolean objects exist, so a Boolean can be recognised by its pointer. For any other
  // number, the C type tells whether it is a floating-point number.
  static Value number(NSNumber* number) {
    if (number == [NSNumber numberWithBool:YES]) return Value(true);
    if (number == [NSNumber numberWithBool:NO]) return Value(false);
    const char* const type = [number objCType];
    const bool isReal =
        std::strcmp(type, @encode(double)) == 0 || std::strcmp(type, @encode(float)) == 0;
    if (isReal) return Value([number doubleValue]);
    const std::int64_t signedValue = [number longLongValue];
    const bool isPastSigned =
        signedValue < 0 && [number compare:[NSNumber numberWithInt:0]] == NSOrderedDescending;
    return isPastSigned ? Value(std::uint64_t{[number unsignedLongLongValue]}) : Value(signedValue);
  }

  // Adds `bytes` to the total size of the copied strings and data. An object that several
  // containers share is copied for each of them, so this total can exceed the size of the file. The
  // limit on that size also applies to this total. Each UTF-16 unit of a string counts as one byte.
  // Returns false if the limit is exceeded.
  bool takes(std::size_t bytes) {
    bytes_ += bytes;
    if (bytes_ > kMostPropertyListBytes) isExceeded_ = true;
    return !isExceeded_;
  }

  std::optional<Value> string(NSString* string) {
    if (!takes([string length])) return std::nullopt;
    return Value(cocoa::toStdString(string));
  }

  std::optional<Value> data(NSData* data) {
    if (!takes([data length])) return std::nullopt;
    const auto* const bytes = static_cast<const std::byte*>([data bytes]);
    return Value(Data(bytes, bytes + [data length]));
  }

  // array() and dictionary() leave out members that are not property-list objects, because some
  // versions of macOS put an NSURL into the information dictionary of a bundle.
  std::optional<Value> array(NSArray* array, std::size_t depth) {
    Array values;
    for (id object in array) {
      std::optional<Value> value = read(object, depth + 1);
      if (isExceeded_) return std::nullopt;
      if (value) values.push_back(*std::move(value));
    }
    return Value(std::move(values));
  }

  std::optional<Value> dictionary(NSDictionary* dictionary, std::size_t depth) {
    std::vector<Dictionary::Pair> pairs;
    for (id key in dictionary) {
      std::optional<Value> value = read([dictionary objectForKey:key], depth + 1);
      if (isExceeded_) return std::nullopt;
      if (!value || ![key isKindOfClass:[NSString class]]) continue;
      if (!takes([key length])) return std::nullopt;
      pairs.emplace_back(cocoa::toStdString(key), *std::move(value));
    }
    return Value(Dictionary(std::move(pairs)));
  }

  std::uint64_t objects_ = 0;
  std::size_t bytes_ = 0;
  bool isExceeded_ = false;
};

struct ToPropertyList {
  id operator()(bool value) const { return [NSNumber numberWithBool:value]; }
  id operator()(std::int64_t value) const { return [NSNumber numberWithLongLong:value]; }
  id operator()(std::uint64_t value) const { return [NSNumber numberWithUnsignedLongLong:value]; }
  id operator()(double value) const { return [NSNumber numberWithDouble:value]; }
  id operator()(const std::string& value) const { return cocoa::toNSString(value); }
  id operator()(const Data& value) const {
    return [NSData dataWithBytes:value.data() length:value.size()];
  }
  id operator()(const Date& value) const {
    return [NSDate dateWithTimeIntervalSinceReferenceDate:value.secondsSinceReferenceDate];
  }
  id operator()(const Array& values) const {
    NSMutableArray* const array = [NSMutableArray array];
    for (const Value& value : values)
      [array addObject:cocoa::toPropertyList(value)];
    return array;
  }
  id operator()(const Dictionary& pairs) const {
    NSMutableDictionary* const dictionary = [NSMutableDictionary dictionary];
    for (const auto& [key, value] : pairs) {
      [dictionary setObject:cocoa::toPropertyList(value) forKey:cocoa::toNSString(key)];
    }
    return dictionary;
  }
};

// Returns the bytes of the file at `path`, or nil if the file is not a regular file, exceeds the
// size limit or cannot be read. Resolves links first, because attributesOfItemAtPath: does not
// follow them.
NSData* contents(NSString* path) {
  NSString* const file = [path stringByResolvingSymlinksInPath];
  NSDictionary* const attributes = [[NSFileManager defaultManager] attributesOfItemAtPath:file
                                                                                    error:nullptr];
  const bool isFile = [[attributes fileType] isEqualToString:NSFileTypeRegular];
  return isFile && [attributes fileSize] <= kMostPropertyListBytes
             ? [NSData dataWithContentsOfFile:file]
             : nil;
}

}  // namespace

namespace cocoa {

std::optional<Dictionary> toDictionary(id object) {
  const std::optional<Value> value = Reader().read(object, 0);
  const Dictionary* const dictionary = value ? value->as<Dictionary>() : nullptr;
  return dictionary ? std::optional(*dictionary) : std::nullopt;
}

id toPropertyList(const Value& value) {
  return std::visit(ToPropertyList(), value.storage());
}

}  // namespace cocoa

std::optional<Dictionary> loadDictionary(const std::string& path) {
  @autoreleasepool {
    NSData* const data = contents(cocoa::toNSString(path));
    if (!data) return std::nullopt;
    @try {
      return cocoa::toDictionary([NSPropertyListSerialization
          propertyListWithData:data
                       options:NSPropertyListImmutable
                        format:nullptr
                         error:nullptr]);
    } @catch (NSException*) {
      return std::nullopt;
    }
  }
}

bool writeDictionaryAtomically(const Dictionary& dictionary, const std::string& path) {
  NSData* const data =
      [NSPropertyListSerialization dataWithPropertyList:cocoa::toPropertyList(dictionary)
                                                 format:NSPropertyListXMLFormat_v1_0
                                                options:0
                                                  error:nullptr];
  if (!data) return false;
  return posix::writeFileAtomically(path, {static_cast<const char*>([data bytes]), [data length]});
}

void removeDictionary(const std::string& path) {
  posix::removeWithTemporaries(path);
}

}  // namespace onramp
