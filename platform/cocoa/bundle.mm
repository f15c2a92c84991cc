#include "platform/bundle.h"

#import "platform/cocoa/property_list.h"
#import "platform/cocoa/text.h"

namespace onramp {

using cocoa::toNSString;
using cocoa::toStdString;

namespace {

// NSBundle caches one object for each bundle, so repeated calls are cheap.
NSBundle* bundleAt(const std::string& path) {
  return [NSBundle bundleWithPath:toNSString(path)];
}

std::optional<std::string> pathOrNothing(NSString* path) {
  return path ? std::optional(toStdString(path)) : std::nullopt;
}

}  // namespace

Bundle Bundle::main() {
  return Bundle(toStdString([[NSBundle mainBundle] bundlePath]));
}

std::optional<Bundle> Bundle::open(const std::string& path) {
  NSBundle* const bundle = bundleAt(path);
  return bundle ? std::optional(Bundle(toStdString([bundle bundlePath]))) : std::nullopt;
}

Dictionary Bundle::infoDictionary() const {
  return cocoa::toDictionary([bundleAt(path_) infoDictionary]).value_or(Dictionary());
}

std::optional<std::string> Bundle::infoString(std::string_view key) const {
  return infoDictionary().string(key);
}

std::optional<std::string> Bundle::localizedInfoString(const std::string& key) const {
  const id text = [bundleAt(path_) objectForInfoDictionaryKey:toNSString(key)];
  return [text isKindOfClass:[NSString class]] ? std::optional(toStdString(text)) : std::nullopt;
}

std::optional<std::string> Bundle::pathForResource(const std::string& name,
                                                   const std::string& type) const {
  return pathOrNothing([bundleAt(path_) pathForResource:toNSString(name) ofType:toNSString(type)]);
}

std::optional<std::string> Bundle::executablePath() const {
  return pathOrNothing([bundleAt(path_) executablePath]);
}

std::string Bundle::localizedString(const std::string& key, const std::string& value,
                                    const std::optional<std::string>& table) const {
  NSBundle* const bundle = bundleAt(path_);
  if (!bundle) return value;
  return toStdString([bundle localizedStringForKey:toNSString(key)
                                             value:toNSString(value)
                                             table:table ? toNSString(*table) : nil]);
}

}  // namespace onramp
