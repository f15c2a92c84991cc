#include "media/medium.h"

#include <utility>

#include "platform/bundle.h"
#include "platform/property_list.h"

namespace onramp::medium {

std::string withoutClosingSlash(std::string path) {
  while (path.size() > 1 && path.back() == '/')
    path.pop_back();
  return path;
}

std::string fullPath(std::string_view bundlePath, const std::optional<std::string>& relativePath) {
  // Everything up to the last "/" is the folder that holds the bundle.
  const std::size_t slash = bundlePath.rfind('/');
  std::string joined(bundlePath.substr(0, slash == std::string_view::npos ? 0 : slash + 1));
  if (relativePath) joined += *relativePath;
  return withoutClosingSlash(std::move(joined));
}

std::string fullPath(const std::optional<std::string>& relativePath) {
  return fullPath(Bundle::main().path(), relativePath);
}

std::optional<Dictionary> loadResourceDictionary() {
  return loadDictionary(fullPath(Bundle::main().infoString("CommonResourcePath")));
}

std::optional<Dictionary> loadNamedDictionary(const std::optional<Dictionary>& resources,
                                              std::string_view key) {
  if (!resources) return std::nullopt;
  const std::optional<std::string> relativePath = resources->string(key);
  return relativePath ? loadDictionary(fullPath(relativePath)) : std::nullopt;
}

std::string vendorName(const std::optional<Dictionary>& resources) {
  std::string vendor = resources ? resources->string(kVenderName).value_or("") : "";
  std::erase(vendor, ' ');
  return vendor;
}

}  // namespace onramp::medium
