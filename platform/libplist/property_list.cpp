#include "platform/property_list.h"

#include <utility>

#include "platform/libplist/parse.h"
#include "platform/posix/file.h"

namespace onramp {

std::optional<Dictionary> loadDictionary(const std::string& path) {
  std::optional<std::string> bytes = posix::readFile(path, kMostPropertyListBytes);
  const auto value = bytes ? libplist::parsePropertyList(std::move(*bytes)) : std::nullopt;
  const auto* const dictionary = value ? value->as<Dictionary>() : nullptr;
  return dictionary ? std::optional(*dictionary) : std::nullopt;
}

bool writeDictionaryAtomically(const Dictionary& dictionary, const std::string& path) {
  const std::string xml = libplist::formatPropertyList(dictionary);
  return !xml.empty() && posix::writeFileAtomically(path, xml);
}

void removeDictionary(const std::string& path) {
  posix::removeWithTemporaries(path);
}

}  // namespace onramp
