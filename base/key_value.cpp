#include "base/key_value.h"

#include <utility>

namespace onramp {

void KeyValueTexts::setValueForKey(const std::string& text, std::string_view key) {
  texts_.insert_or_assign(std::string(key), text);
  const auto bound = setters_.find(key);
  if (bound == setters_.end()) return;
  for (const Setter& setter : bound->second)
    setter(text);
}

std::string KeyValueTexts::valueForKey(std::string_view key) const {
  const auto found = texts_.find(key);
  return found == texts_.end() ? std::string() : found->second;
}

void KeyValueTexts::bind(std::string_view key, Setter setter) {
  const auto found = texts_.find(key);
  if (found != texts_.end()) setter(found->second);
  setters_[std::string(key)].push_back(std::move(setter));
}

}  // namespace onramp
